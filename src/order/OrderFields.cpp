#include "order/OrderFields.h"

#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

OrderFields detailFields(OrderDetails& shemot) {
    return {{u"Shemot.ser"_s, &shemot.ser},       {u"Shemot.n1"_s, &shemot.n1},
            {u"Shemot.n2"_s, &shemot.n2},         {u"Shemot.n3"_s, &shemot.n3},
            {u"Shemot.n4"_s, &shemot.n4},         {u"Shemot.TotalPics"_s, &shemot.TotalPics},
            {u"Shemot.Mail"_s, &shemot.Mail},     {u"Shemot.TimeOfJob"_s, &shemot.TimeOfJob},
            {u"Shemot.Hearot"_s, &shemot.Hearot}, {u"Shemot.ppr"_s, &shemot.ppr},
            {u"Shemot.T1"_s, &shemot.T1},         {u"Shemot.Bord"_s, &shemot.Bord},
            {u"Shemot.maat"_s, &shemot.maat},     {u"Shemot.FillFit"_s, &shemot.FillFit}};
}

namespace {

QString extraKey(std::size_t number) {
    return u"Tosafot1_%1"_s.arg(number);
}

QString specialExtraKey(std::size_t number) {
    return u"Tosafot2_%1"_s.arg(number);
}

} // namespace

OrderFields albumFields(AlbumDetails& album) {
    OrderFields fields = {{u"GodelLBM"_s, &album.GodelLBM},   {u"Hearot"_s, &album.HearotLBM},
                          {u"MailZalam"_s, &album.MailZalam}, {u"ShemErooa"_s, &album.ShemErooa},
                          {u"ShemZalam"_s, &album.ShemZalam}, {u"SoogKricha"_s, &album.SoogKricha},
                          {u"SoogLBM"_s, &album.SoogLBM},     {u"SoogNiar"_s, &album.SoogNiar}};
    for (std::size_t i = 1; i < album.Tosafot1.size(); ++i)
        fields += {extraKey(i), &album.Tosafot1[i - 1]};
    for (std::size_t i = 1; i < album.Tosafot2.size(); ++i)
        fields += {specialExtraKey(i), &album.Tosafot2[i - 1]};
    return fields;
}

OrderFields lastExtras(AlbumDetails& album) {
    return {{extraKey(album.Tosafot1.size()), &album.Tosafot1.back()},
            {specialExtraKey(album.Tosafot2.size()), &album.Tosafot2.back()}};
}

} // namespace lumora
