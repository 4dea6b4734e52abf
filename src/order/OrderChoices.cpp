#include "order/OrderChoices.h"

#include "common/FixedText.h"
#include "order/OrderFields.h"
#include "session/SessionState.h"

#include <variant>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using Field = std::variant<QString*, std::int16_t*, bool*, OrderKind*, Sender*>;

struct Choice {
    QString key;
    Field field;
};

QList<Choice> choicesIn(SessionState& state) {
    OrderDetails& shemot = state.shemot;
    AlbumDetails& album = state.album;
    QList<Choice> choices = {{u"Optint"_s, &state.Optint},
                             {u"MisparHazmana"_s, &state.MisparHazmana},
                             {u"HazmanaP"_s, &state.transfer.HazmanaP},
                             {u"SugSheliach"_s, &state.transfer.SugSheliach},
                             {u"KodMishloach"_s, &state.KodMishloach},
                             {u"KodMishloachMakor"_s, &state.KodMishloachMakor},
                             {u"MishloachHabaita"_s, &state.MishloachHabaita},
                             {u"EnglishTips"_s, &state.EnglishTips},
                             {u"TachanaMekomit"_s, &state.TachanaMekomit},
                             {u"TmunatPaar"_s, &state.TmunatPaar},
                             {u"ModulRezef"_s, &state.ModulRezef},
                             {u"DchisaAmoka"_s, &state.DchisaAmoka},
                             {u"SugTzad"_s, &state.SugTzad},
                             {u"BranchChoice"_s, &state.BranchChoice},
                             {u"MisparKoopon"_s, &state.coupon.MisparKoopon},
                             {u"Shemot.Soog1"_s, &shemot.Soog1},
                             {u"Shemot.Soog2"_s, &shemot.Soog2},
                             {u"Shemot.CustomCode"_s, &shemot.CustomCode},
                             {u"Shemot.Girsa"_s, &shemot.Girsa},
                             {u"TelZalam"_s, &album.TelZalam},
                             {u"KamutHorim"_s, &album.KamutHorim},
                             {u"SoogHorim"_s, &album.SoogHorim}};
    for (const OrderField& field : lastExtras(album) + detailFields(shemot) + albumFields(album)) {
        if (auto* const* text = std::get_if<QString*>(&field.value))
            choices += {field.key, *text};
        else if (auto* const* number = std::get_if<std::int16_t*>(&field.value))
            choices += {field.key, *number};
    }
    return choices;
}

// Behind it stands a number from 1.
constexpr QStringView noJpegKey = u"NoJpeg_";

struct AsText {
    QString operator()(const QString* text) const { return *text; }
    QString operator()(const std::int16_t* number) const { return QString::number(*number); }
    QString operator()(const bool* truth) const { return *truth ? u"-1"_s : u"0"_s; }
    template <class Enum>
    QString operator()(const Enum* kind) const {
        return QString::number(static_cast<int>(*kind));
    }
};

struct FromText {
    const QString& value;

    void operator()(QString* text) const { *text = value; }
    void operator()(std::int16_t* number) const { *number = Val16(value); }
    void operator()(bool* truth) const { *truth = Val16(value) != 0; }
    template <class Enum>
    void operator()(Enum* kind) const {
        *kind = static_cast<Enum>(Val16(value));
    }
};

} // namespace

QList<ListOutputEntry> ChoicesOf(const SessionState& state) {
    SessionState copy = state; // choicesIn() needs a session that is not const
    QList<ListOutputEntry> choices;
    for (const Choice& choice : choicesIn(copy))
        choices += {choice.key, std::visit(AsText{}, choice.field)};
    int number = 0;
    for (const LeftOut& picture : state.transfer.leftOut) {
        if (picture.why == LeftOut::Why::NoJpeg)
            choices += {noJpegKey.toString() + QString::number(++number), picture.picture.text()};
    }
    return choices;
}

void TakeChoices(const QList<ListOutputEntry>& choices, SessionState& state) {
    const QList<Choice> known = choicesIn(state);
    state.transfer.leftOut.clear();
    for (const auto& [key, value] : choices) {
        if (key.startsWith(noJpegKey))
            state.transfer.leftOut += LeftOut{DrivePath(value), LeftOut::Why::NoJpeg};
        for (const Choice& choice : known) {
            if (choice.key == key)
                std::visit(FromText{value}, choice.field);
        }
    }
}

} // namespace lumora
