#pragma once

#include "common/ResultDesk.h"
#include "imaging/Bitmap.h"
#include "order/PrintFile.h"

#include <QObject>

#include <vector>

namespace lumora {

class Files;
class OrderFolder;

// The first prints of an order as small pictures. They are taken out of its print files by a thread of its own, so that
// the page goes on meanwhile.
class PrintPreviews : public QObject {
    Q_OBJECT
public:
    static constexpr int most = 5;
    static constexpr int side = 480; // pixels of the longer side

    explicit PrintPreviews(const Files& files)
        : m_files(files) {}

    // Reads those of the folder, each folder once. Ready where there is any.
    void read(const OrderFolder& folder, PrintFileShape shape);
    // In the order of the basket; a print that can't be read is left out.
    const std::vector<Bitmap>& pictures() const { return m_pictures; }

Q_SIGNALS:
    void ready();

private:
    void settle(const QString& folder, const std::vector<Bitmap>& pictures);

    const Files& m_files;
    QString m_folder;
    std::vector<Bitmap> m_pictures;
    ResultDesk<PrintPreviews> m_desk{this};
};

} // namespace lumora
