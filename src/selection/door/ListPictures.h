#pragma once

#include "common/DoorRules.h"
#include "common/Result.h"
#include "common/ResultDesk.h"
#include "imaging/Bitmap.h"
#include "platform/files/HostPath.h"

#include <QObject>

#include <stop_token>

namespace lumora {

// What a list of files shows of each picture, in a square cell: upright where the lab wants that, and of other formats
// where those go through the door. Read in the background, so that a card that hangs holds nobody.
class ListPictures : public QObject {
    Q_OBJECT
public:
    // doorProgram decodes the other formats; cell: pixels.
    ListPictures(HostPath doorProgram, DoorRules rules, int cell);
    ~ListPictures() override;

    // As many as a caller should have read at once.
    static constexpr int atATime = 3;

    // Reads this one, whatever is being read.
    void read(int row, const HostPath& path);
    // Of those that are still being read nothing is told any more.
    void stop();

Q_SIGNALS:
    void done(int row, const lumora::Result<lumora::Bitmap>& picture);

private:
    const HostPath m_doorProgram;
    const DoorRules m_rules;
    const int m_cell;
    std::stop_source m_stop;
    ResultDesk<ListPictures> m_desk{this};
};

} // namespace lumora
