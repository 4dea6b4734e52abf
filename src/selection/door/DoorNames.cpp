#include "selection/door/DoorNames.h"

#include "common/AnsiCodePage.h"

#include <QSet>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

bool keepsItsName(const QString& name) {
    return (name.endsWith(u".jpg"_s) || name.endsWith(u".JPG"_s)) && AnsiCodePage::holds(name);
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
            AnsiCodePage::holds(letter) ? QString(letter) : QString(letter).normalized(QString::NormalizationForm_D);
        for (const QChar part : plain) {
            if (AnsiCodePage::holds(part) && !u"<>:\"/\\|*?"_s.contains(part) && part.isPrint())
                kept += part;
        }
    }
    return kept.trimmed();
}

} // namespace

QStringList doorNames(const QStringList& names) {
    QSet<QString> taken;
    for (const QString& name : names) {
        if (keepsItsName(name))
            taken += name.toCaseFolded();
    }
    QStringList result;
    for (const QString& name : names) {
        result += keepsItsName(name)
                      ? name
                      : freeDoorName(name, [&](const QString& made) { return taken.contains(made.toCaseFolded()); });
        taken += result.last().toCaseFolded();
    }
    return result;
}

QString freeDoorName(const QString& name, const std::function<bool(const QString&)>& isTaken) {
    const QString own = inCodePage(stemOf(name));
    QString made = own.isEmpty() ? u"picture 1.jpg"_s : own + u".jpg"_s;
    for (int number = 2; isTaken(made); ++number)
        made = own.isEmpty() ? u"picture %1.jpg"_s.arg(number) : own + u" (%1).jpg"_s.arg(number);
    return made;
}

} // namespace lumora
