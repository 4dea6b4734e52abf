#include "common/DrivePath.h"

#include "common/FixedText.h"

#include <algorithm>

namespace lumora {
namespace {

constexpr QChar backslash = u'\\';

} // namespace

QString DrivePath::leaf() const {
    const qsizetype at = m_text.lastIndexOf(backslash);
    return at < 0 ? notChosen : m_text.mid(at + 1);
}

QString DrivePath::stem() const {
    const QString name = leaf();
    return name.chopped(std::min<qsizetype>(4, name.size()));
}

DrivePath DrivePath::folder() const {
    const qsizetype at = m_text.lastIndexOf(backslash);
    return DrivePath(at < 0 || m_text.size() < 3 ? notChosen : m_text.left(at));
}

DrivePath DrivePath::operator/(QStringView name) const {
    QString path = m_text.endsWith(backslash) ? m_text : m_text + backslash;
    return DrivePath(path.append(name));
}

QString MangleFileName(const DrivePath& path) {
    QString name = path.text();
    return name.replace(backslash, u']').replace(u':', u';');
}

} // namespace lumora
