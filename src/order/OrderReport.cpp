#include "order/OrderReport.h"

#include "common/PaperSize.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

bool isReported(const TransferState& transfer) {
    return transfer.SugMishloah == Sending::NewOrder || transfer.SugMishloah == Sending::Resend;
}

// A line break inside a value would end the HTTP request line.
QString onOneLine(QString value) {
    for (QChar& letter : value) {
        if (letter == u'\r' || letter == u'\n' || letter == QChar(u'\0'))
            letter = u' ';
    }
    return value;
}

QString valueIn(const QString& value, ReportForm form) {
    if (form == ReportForm::AsItStands)
        return value;
    QString encoded;
    for (const QChar letter : value) {
        if (u"%&#+"_s.contains(letter))
            encoded += u'%' + QString::number(letter.unicode(), 16).toUpper();
        else
            encoded += letter;
    }
    return encoded;
}

} // namespace

QString PaperKindLetter(const QString& maat) {
    const auto is = [&](const QString& word) { return maat.compare(word, Qt::CaseInsensitive) == 0; };
    if (is(u"מט"_s) || is(u"MAT"_s) || is(u"MATTE"_s))
        return u"M"_s;
    if (is(u"מבריק"_s) || is(u"GLOSSY"_s))
        return u"G"_s;
    return {};
}

QString OrderReportQuery(const ClientProfile& profile, const TransferState& transfer, const OrderDetails& shemot,
                         ReportForm form) {
    if (!isReported(transfer))
        return {};
    const QString order = transfer.ShemTikiya + u"    "_s + SizeCode(shemot.ppr, u"_"_s) +
                          PaperKindLetter(shemot.maat) + u'_' + shemot.FillFit + u'_' + shemot.Bord;
    return onOneLine(u"?k1="_s + valueIn(profile.ClientCode, form) + u"&t1="_s + valueIn(order, form) +
                     u"&t2=Notes: "_s + valueIn(shemot.Hearot, form) + u"&t3=Pratim: "_s +
                     valueIn(shemot.n2 + u"    "_s + shemot.n1, form) + u"&t4=Adress: "_s + valueIn(shemot.n3, form) +
                     u"&t5=Mail: "_s + valueIn(shemot.Mail, form) + u"&t8=Total_pics: "_s +
                     QString::number(shemot.TotalPics));
}

QString DoneQuery(const ClientProfile& profile, const TransferState& transfer, ReportForm form) {
    if (!isReported(transfer))
        return {};
    return onOneLine(u"?t1="_s + valueIn(profile.ClientCode, form) + u"&t2=true"_s);
}

} // namespace lumora
