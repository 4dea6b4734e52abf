#include "selection/door/DoorNames.h"

#include "common/AnsiCodePage.h"
#include "common/FixedText.h"

#include <QSet>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr const char16_t* endings[] = {u".jpg",  u".jpeg", u".jpe",  u".png", u".heic", u".heif",
                                       u".avif", u".webp", u".tiff", u".tif", u".bmp",  u".gif"};

bool isInCodePage(const QString& text) {
    return !HasQuestionMark(AnsiCodePage::squeeze(text));
}

bool keepsItsName(const QString& name) {
    return (name.endsWith(u".jpg"_s) || name.endsWith(u".JPG"_s)) && isInCodePage(name);
}

QString stemOf(const QString& name) {
    const qsizetype dot = name.lastIndexOf(u'.');
    return dot < 0 ? name : name.left(dot);
}

QString inCodePage(const QString& text) {
    QString kept;
    const QString whole = text.normalized(QString::NormalizationForm_C);
    for (const QChar letter : whole) {
        const QString plain =
            isInCodePage(letter) ? QString(letter) : QString(letter).normalized(QString::NormalizationForm_D);
        for (const QChar part : plain) {
            if (isInCodePage(part) && !u"<>:\"/\\|*?"_s.contains(part) && part.isPrint())
                kept += part;
        }
    }
    return kept.trimmed();
}

} // namespace

QString picturePatterns(bool everyFormat) {
    if (!everyFormat)
        return u"*.jpg"_s;
    QStringList patterns;
    for (const char16_t* ending : endings)
        patterns += u'*' + QString::fromUtf16(ending);
    return patterns.join(u';');
}

bool isPictureName(const QString& name, bool everyFormat) {
    const auto ends = [&](const char16_t* ending) {
        return name.endsWith(QString::fromUtf16(ending), Qt::CaseInsensitive);
    };
    return everyFormat ? std::any_of(std::begin(endings), std::end(endings), ends) : ends(u".jpg");
}

QStringList doorNames(const QStringList& names) {
    QSet<QString> taken;
    for (const QString& name : names) {
        if (keepsItsName(name))
            taken += name.toCaseFolded();
    }
    QStringList result;
    for (const QString& name : names) {
        if (keepsItsName(name)) {
            result += name;
            continue;
        }
        const QString own = inCodePage(stemOf(name));
        QString made = own.isEmpty() ? u"picture 1.jpg"_s : own + u".jpg"_s;
        for (int number = 2; taken.contains(made.toCaseFolded()); ++number)
            made = own.isEmpty() ? u"picture %1.jpg"_s.arg(number) : own + u" (%1).jpg"_s.arg(number);
        taken += made.toCaseFolded();
        result += made;
    }
    return result;
}

} // namespace lumora
