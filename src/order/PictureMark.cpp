#include "order/PictureMark.h"

#include "common/DrivePath.h"
#include "platform/files/Files.h"

#include <QCryptographicHash>

#include <fstream>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr std::streamsize hashed = 16 * 1024;

} // namespace

QString PictureMark(const Files& files, const DrivePath& picture) {
    const Result<qint64> size = files.size(picture);
    const Result<HostPath> host = files.host(picture);
    if (!size || !host)
        return {};
    std::ifstream stream(*host, std::ios::binary);
    QByteArray head(hashed, '\0');
    stream.read(head.data(), hashed);
    head.truncate(stream.gcount());
    if (stream.bad() || head.isEmpty())
        return {};
    return u"%1 %2"_s.arg(*size).arg(
        QLatin1StringView(QCryptographicHash::hash(head, QCryptographicHash::Sha1).toHex()));
}

} // namespace lumora
