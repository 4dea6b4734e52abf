#pragma once

#include "common/Result.h"
#include "order/OrderFolder.h"
#include "order/OrderTail.h"
#include "order/PrintFile.h"

#include <QByteArray>
#include <QString>

#include <functional>
#include <optional>

namespace lumora {

class Files;
struct SessionState;

// Puts the prints of one order into its folder, one print file a line of the basket. Every print passes through the
// scratch file first. The tail is made once: it has the totals of the whole order.
class PrintPacker {
public:
    // tailForm: as SugTzad, 40 or 60 bytes, any other value none.
    PrintPacker(const SessionState& state, const Files& files, OrderFolder folder, int tailForm);

    const OrderFolder& folder() const { return m_folder; }

    // Begins a step and makes the folder if it is missing; pack() returns a failure of that.
    void beginStep();

    struct Line {
        int index; // in the basket, from 0
        QString code;
        DrivePath path;
    };
    struct Outcome {
        bool packed = false;
        // Set when a file of the order could not be written, not for a picture that can't be read.
        std::optional<Failure> writeFailure;
        // Set when what was written of such a print can't be removed: the order must not be sent with it.
        std::optional<Failure> removeFailure;
    };
    // Removes the scratch picture of the step before, makes a new one by picture() and writes its print file. If
    // picture() fails there is no scratch picture, so that no picture is printed as the one before it.
    Outcome pack(const Line& line, const std::function<Result<QByteArray>()>& picture);

    // Removes the scratch picture.
    void removeScratch() const;
    const DrivePath& scratch() const { return m_scratch; }

    // The present step as a line of a manifest: length, code, running number, name.
    const QString& manifestLine() const { return m_manifestLine; }

private:
    const SessionState& m_state;
    const Files& m_files;
    const OrderFolder m_folder;
    const OrderTail m_tail;
    const PrintFileShape m_shape;
    const DrivePath m_scratch;
    const int m_tailForm;
    Result<void> m_folderThere;
    QString m_manifestLine;
    int m_runningNumber = 1;
};

} // namespace lumora
