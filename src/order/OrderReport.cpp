#include "order/OrderReport.h"

#include "common/PaperSize.h"
#include "session/SessionState.h"

namespace lumora {

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

} // namespace

QString PaperKindLetter(const QString& maat) {
    const auto is = [&](const QString& word) { return maat.compare(word, Qt::CaseInsensitive) == 0; };
    if (is(QStringLiteral("מט")) || is(QStringLiteral("MAT")) || is(QStringLiteral("MATTE")))
        return QStringLiteral("M");
    if (is(QStringLiteral("מבריק")) || is(QStringLiteral("GLOSSY")))
        return QStringLiteral("G");
    return {};
}

QString OrderReportQuery(const ClientProfile& profile, const TransferState& transfer, const OrderDetails& shemot) {
    if (!isReported(transfer))
        return {};
    return onOneLine(QStringLiteral("?k1=") + profile.ClientCode +                           //
                     QStringLiteral("&t1=") + transfer.ShemTikiya + QStringLiteral("    ") + //
                     SizeCode(shemot.ppr, QStringLiteral("_")) + PaperKindLetter(shemot.maat) + u'_' + shemot.FillFit +
                     u'_' + shemot.Bord + QStringLiteral("&t2=Notes: ") + shemot.Hearot + //
                     QStringLiteral("&t3=Pratim: ") + shemot.n2 + QStringLiteral("    ") + shemot.n1 +
                     QStringLiteral("&t4=Adress: ") + shemot.n3 + //
                     QStringLiteral("&t5=Mail: ") + shemot.Mail + //
                     QStringLiteral("&t8=Total_pics: ") + QString::number(shemot.TotalPics));
}

QString DoneQuery(const ClientProfile& profile, const TransferState& transfer) {
    if (!isReported(transfer))
        return {};
    return onOneLine(QStringLiteral("?t1=") + profile.ClientCode + QStringLiteral("&t2=true"));
}

} // namespace lumora
