#include "finished/mail/MailLetter.h"

#include "session/SessionState.h"

#include <QStringList>

namespace lumora {

using namespace Qt::StringLiterals;

QString MailLetter(const SessionState& state, const OrderDetails& details, const QString& fileName,
                   const QString& package) {
    QString letter;
    const auto add = [&](const QString& hebrew, const QString& english, const QString& value) {
        if (!value.trimmed().isEmpty())
            letter += state.wording(hebrew, english) + u": "_s + value + u'\n';
    };
    add(u"שם"_s, u"Name"_s, details.n1);
    add(u"טלפון"_s, u"Telephone"_s, details.n2);
    add(u"דואר אלקטרוני"_s, u"E-mail"_s, details.Mail);
    add(u"נייר"_s, u"Paper"_s, QStringList{details.ppr, details.maat, details.Bord, details.FillFit}.join(u' '));
    add(u"הערות"_s, u"Remarks"_s, details.Hearot);
    add(u"סך תמונות"_s, u"Total pictures"_s, QString::number(details.TotalPics));
    add(u"קובץ"_s, u"File"_s, fileName);
    return letter + package + u'\n';
}

} // namespace lumora
