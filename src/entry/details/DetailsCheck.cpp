#include "entry/details/DetailsCheck.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

namespace lumora {

QString detailsMessage(DetailsMessage message, bool english) {
    static const struct {
        const char16_t* hebrew;
        const char16_t* english;
    } texts[] = {
        {u"לא נמצאו פרטים בזיכרון נא הקלד פרטים", u"No details in the memory\nPlease insert your details"},
        {u"נא להקליד שם ושם שפחה", u"Please insert First & Last Name"},
        {u"בקשת שנשלח את התמונות עד הבית\nנא להקליד כתובת דואר", u"Please insert your Address"},
        {u"לא כתבת שם פרטי ומשפחה", u"Please insert First & Last Name"},
        {u"עליך להקליד כתובתך ונדע לאן לשלוח את התמונות כפי שבקשת\nהקפד להקליד רחוב מיספר ועיר\n"
         u"נא הקלד בחלונית הירוקה\nיש לוודא שהפרטים מדוייקים",
         u"Please insert your Address\nin the green Text Box"},
        {u"הקש רק מספרים ומקף", u"Please insert only Numbers"},
        {u"לא כתבתה מספר טלפון", u"Please insert your Phone Number"},
    };
    const auto& text = texts[static_cast<int>(message)];
    return QString::fromUtf16(english ? text.english : text.hebrew);
}

bool IsPhoneOk(const QString&) {
    return true;
}

void takeDetails(OrderDetails& shemot, const QString& name, const QString& telephone, const QString& address) {
    shemot.n1 = name.trimmed();
    shemot.n2 = telephone.trimmed();
    shemot.n3 = address.trimmed();
}

std::optional<DetailsProblem> checkTyped(const SessionState& state, const QString& name, const QString& address) {
    using Place = DetailsProblem::Place;
    if (name.trimmed().isEmpty())
        return DetailsProblem{detailsMessage(DetailsMessage::NameBeforeOptions, state.english()), Place::Name};
    if (address.trimmed().isEmpty() && state.MishloachHabaita)
        return DetailsProblem{detailsMessage(DetailsMessage::AddressBeforeOptions, state.english()), Place::Address};
    return std::nullopt;
}

std::optional<DetailsProblem> CheckDetails(const SessionState& state) {
    using Place = DetailsProblem::Place;
    const OrderDetails& shemot = state.shemot;
    const auto message = [&](DetailsMessage which) { return detailsMessage(which, state.english()); };
    const struct {
        bool missing;
        Place place;
        QString message;
    } checks[] = {
        {shemot.n1.isEmpty(), Place::Name, message(DetailsMessage::NoName)},
        {shemot.n2.isEmpty(), Place::Telephone, message(DetailsMessage::NoTelephone)},
        {shemot.n3.isEmpty() && state.MishloachHabaita, Place::Address, message(DetailsMessage::NoAddress)},
        {shemot.ppr == notChosen, Place::Size, state.wording(u"לא בחרת גודל נייר", u"Please choose a paper size")},
        {shemot.maat == notChosen, Place::Kind,
         state.wording(u"לא בחר סוג נייר  מט או מבריק", u"Please choose a paper kind, matte or glossy")},
        {shemot.Bord.isEmpty(), Place::Border, state.wording(u"לא בחרת סוג מסגרת", u"Please choose a border")},
    };
    for (const auto& check : checks) {
        if (check.missing)
            return DetailsProblem{check.message, check.place};
    }
    return std::nullopt;
}

} // namespace lumora
