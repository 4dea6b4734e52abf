#include "finished/mail/MailLetter.h"

#include "session/SessionState.h"

#include <QStringList>

namespace lumora {

QString MailLetter(const SessionState& state, const OrderDetails& details, const QString& fileName,
                   const QString& package) {
    QString letter;
    const auto add = [&](const QString& hebrew, const QString& english, const QString& value) {
        if (!value.trimmed().isEmpty())
            letter += state.wording(hebrew, english) + QStringLiteral(": ") + value + u'\n';
    };
    add(QStringLiteral("שם"), QStringLiteral("Name"), details.n1);
    add(QStringLiteral("טלפון"), QStringLiteral("Telephone"), details.n2);
    add(QStringLiteral("דואר אלקטרוני"), QStringLiteral("E-mail"), details.Mail);
    add(QStringLiteral("נייר"), QStringLiteral("Paper"),
        QStringList{details.ppr, details.maat, details.Bord, details.FillFit}.join(u' '));
    add(QStringLiteral("הערות"), QStringLiteral("Remarks"), details.Hearot);
    add(QStringLiteral("סך תמונות"), QStringLiteral("Total pictures"), QString::number(details.TotalPics));
    add(QStringLiteral("קובץ"), QStringLiteral("File"), fileName);
    return letter + package + u'\n';
}

} // namespace lumora
