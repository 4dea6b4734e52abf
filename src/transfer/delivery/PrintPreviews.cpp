#include "transfer/delivery/PrintPreviews.h"

#include "common/Background.h"
#include "order/OrderFolder.h"
#include "order/PrintFileName.h"
#include "platform/files/Files.h"

#include <QBuffer>
#include <QFile>
#include <QImageReader>

#include <algorithm>
#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// A longer print file holds a picture that is not worth the wait.
constexpr qint64 longestFile = qint64(48) << 20;

Bitmap previewOf(const HostPath& path, PrintFileShape shape) {
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly) || file.size() > longestFile)
        return {};
    Result<PrintFileContent> print = readPrintFile(file.readAll(), shape);
    if (!print)
        return {};
    QBuffer buffer(&print->picture);
    QImageReader reader(&buffer, "jpg");
    if (reader.size().isEmpty())
        return {};
    reader.setScaledSize(reader.size().scaled(PrintPreviews::side, PrintPreviews::side, Qt::KeepAspectRatio));
    return Bitmap(reader.read().convertToFormat(QImage::Format_RGB32));
}

std::vector<HostPath> firstPrints(const Files& files, const OrderFolder& folder) {
    std::vector<std::pair<int, QString>> prints;
    for (const QString& name : files.names(folder.path(), u"*.jpp"_s)) {
        if (const std::optional<PrintFileName> print = PrintFileName::parse(name))
            prints.emplace_back(print->index, name);
    }
    std::ranges::sort(prints);
    std::vector<HostPath> paths;
    for (const auto& [index, name] : prints) {
        const Result<HostPath> path = files.host(folder.filePath(name));
        if (path && paths.size() < PrintPreviews::most)
            paths.push_back(*path);
    }
    return paths;
}

} // namespace

void PrintPreviews::read(const OrderFolder& folder, PrintFileShape shape) {
    const QString path = folder.path().text();
    if (m_folder == path)
        return;
    m_folder = path;
    m_pictures.clear();
    runInBackground([ticket = m_desk.ticket(), path, shape, prints = firstPrints(m_files, folder)] {
        std::vector<Bitmap> pictures;
        for (const HostPath& print : prints) {
            if (Bitmap picture = previewOf(print, shape); !picture.isNull())
                pictures.push_back(std::move(picture));
        }
        ticket.handIn([path, pictures](PrintPreviews& previews) { previews.settle(path, pictures); });
    });
}

void PrintPreviews::settle(const QString& folder, const std::vector<Bitmap>& pictures) {
    if (m_folder != folder || pictures.empty())
        return;
    m_pictures = pictures;
    Q_EMIT ready();
}

} // namespace lumora
