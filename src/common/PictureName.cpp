#include "common/PictureName.h"

#include <QStringList>

#include <algorithm>
#include <iterator>

namespace lumora {

namespace {

constexpr QStringView endings[] = {u".jpg",  u".jpeg", u".jpe",  u".png", u".heic", u".heif",
                                   u".avif", u".webp", u".tiff", u".tif", u".bmp",  u".gif"};

constexpr std::size_t offered(bool everyFormat) {
    return everyFormat ? std::size(endings) : 1;
}

} // namespace

bool isPictureFile(QStringView name, bool everyFormat) {
    return std::any_of(endings, endings + offered(everyFormat), [name](QStringView ending) {
        return name.size() > ending.size() && name.endsWith(ending, Qt::CaseInsensitive);
    });
}

QString picturePatterns(bool everyFormat) {
    QStringList patterns;
    for (std::size_t i = 0; i < offered(everyFormat); ++i)
        patterns += u'*' + endings[i].toString();
    return patterns.join(u';');
}

} // namespace lumora
