#include "entry/details/DetailsCheck.h"

#include "common/DrivePathText.h"
#include "session/SessionState.h"

namespace lumora {

DetailsMessages detailsMessages(bool english) {
    if (english)
        return {QStringLiteral("No details in the memory\nPlease insert your details"),
                QStringLiteral("Please insert First & Last Name"),
                QStringLiteral("Please insert your Address"),
                QStringLiteral("Please insert First & Last Name"),
                QStringLiteral("Please insert your Address\nin the green Text Box"),
                QStringLiteral("Please insert only Numbers"),
                QStringLiteral("Please insert your Phone Number")};
    return {QStringLiteral("לא נמצאו פרטים בזיכרון נא הקלד פרטים"),
            QStringLiteral("נא להקליד שם ושם שפחה"),
            QStringLiteral("בקשת שנשלח את התמונות עד הבית\nנא להקליד כתובת דואר"),
            QStringLiteral("לא כתבת שם פרטי ומשפחה"),
            QStringLiteral("עליך להקליד כתובתך ונדע לאן לשלוח את התמונות כפי שבקשת\nהקפד להקליד רחוב מיספר ועיר\nנא "
                           "הקלד בחלונית הירוקה\nיש לוודא שהפרטים מדוייקים"),
            QStringLiteral("הקש רק מספרים ומקף"),
            QStringLiteral("לא כתבתה מספר טלפון")};
}

bool IsPhoneOk(const QString&) {
    return true;
}

void takeDetails(SessionState& state, const QString& name, const QString& telephone, const QString& address) {
    state.shemot.n1 = name.trimmed();
    state.shemot.n2 = telephone.trimmed();
    state.shemot.n3 = address.trimmed();
}

std::optional<DetailsProblem> checkTyped(const SessionState& state, const QString& name, const QString& address) {
    using Place = DetailsProblem::Place;
    const DetailsMessages messages = detailsMessages(state.english());
    if (name.trimmed().isEmpty())
        return DetailsProblem{messages[1], Place::Name};
    if (address.trimmed().isEmpty() && state.MishloachHabaita)
        return DetailsProblem{messages[2], Place::Address};
    return std::nullopt;
}

std::optional<DetailsProblem> CheckDetails(const SessionState& state) {
    using Place = DetailsProblem::Place;
    const OrderDetails& shemot = state.shemot;
    const DetailsMessages messages = detailsMessages(state.english());
    if (shemot.n1.isEmpty())
        return DetailsProblem{messages[3], Place::Name};
    if (shemot.n2.isEmpty())
        return DetailsProblem{messages[6], Place::Telephone};
    if (shemot.n3.isEmpty() && state.MishloachHabaita)
        return DetailsProblem{messages[4], Place::Address};
    if (shemot.ppr == notChosen)
        return DetailsProblem{
            state.wording(QStringLiteral("לא בחרת גודל נייר"), QStringLiteral("Please choose a paper size")),
            Place::Size};
    if (shemot.maat == notChosen)
        return DetailsProblem{state.wording(QStringLiteral("לא בחר סוג נייר  מט או מבריק"),
                                            QStringLiteral("Please choose a paper kind, matte or glossy")),
                              Place::Kind};
    if (shemot.Bord.isEmpty())
        return DetailsProblem{
            state.wording(QStringLiteral("לא בחרת סוג מסגרת"), QStringLiteral("Please choose a border")),
            Place::Border};
    return std::nullopt;
}

} // namespace lumora
