#include "order/KeptPictures.h"

#include <QCryptographicHash>

namespace lumora {

using namespace Qt::StringLiterals;

PictureStamp stampOf(const HostPath& path) {
    std::error_code length;
    std::error_code time;
    PictureStamp stamp{std::filesystem::file_size(path, length), std::filesystem::last_write_time(path, time), true};
    return length || time ? PictureStamp() : stamp;
}

DrivePath KeptPictures::copyOf(const DrivePath& picture) const {
    const QByteArray key = QCryptographicHash::hash(picture.text().toUtf8(), QCryptographicHash::Sha1).toHex();
    return m_orderFolder / u"kept" / QString::fromLatin1(key.left(16));
}

bool KeptPictures::has(const DrivePath& picture) const {
    return !m_orderFolder.isEmpty() && m_files.fileExists(copyOf(picture));
}

// What was made of a picture stands in the order's folder itself; a copy of its source is none of it.
DrivePath KeptPictures::fileOf(const DrivePath& picture) const {
    const bool made = picture.text().startsWith(m_orderFolder.text() + u'\\');
    return !made && has(picture) ? copyOf(picture) : picture;
}

std::optional<HostPath> KeptPictures::hostOf(const DrivePath& picture) const {
    return m_files.drives().toHost(fileOf(picture));
}

PictureStamp KeptPictures::copiedStamp(const DrivePath& picture) const {
    const std::optional<HostPath> copy =
        m_orderFolder.isEmpty() ? std::nullopt : m_files.drives().toHost(copyOf(picture));
    return copy ? stampOf(*copy) : PictureStamp();
}

Result<HostPath> KeptPictures::targetOf(const DrivePath& picture) const {
    const DrivePath copy = copyOf(picture);
    for (const DrivePath& folder : {m_orderFolder.folder(), m_orderFolder, copy.folder()}) {
        if (const Result<void> there = m_files.makeFolder(folder); !there)
            return there.failure();
    }
    return m_files.host(copy);
}

} // namespace lumora
