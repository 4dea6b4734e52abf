#include "order/OrderChoices.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

#include <variant>

namespace lumora {
namespace {

using Field = std::variant<QString*, std::int16_t*, bool*, OrderKind*, Sender*>;

struct Choice {
    QString key;
    Field field;
};

QList<Choice> choicesIn(SessionState& state) {
    OrderDetails& shemot = state.shemot;
    AlbumDetails& album = state.album;
    QList<Choice> choices = {{QStringLiteral("Optint"), &state.Optint},
                             {QStringLiteral("MisparHazmana"), &state.MisparHazmana},
                             {QStringLiteral("HazmanaP"), &state.transfer.HazmanaP},
                             {QStringLiteral("SugSheliach"), &state.transfer.SugSheliach},
                             {QStringLiteral("KodMishloach"), &state.KodMishloach},
                             {QStringLiteral("KodMishloachMakor"), &state.KodMishloachMakor},
                             {QStringLiteral("MishloachHabaita"), &state.MishloachHabaita},
                             {QStringLiteral("EnglishTips"), &state.EnglishTips},
                             {QStringLiteral("TachanaMekomit"), &state.TachanaMekomit},
                             {QStringLiteral("TmunatPaar"), &state.TmunatPaar},
                             {QStringLiteral("ModulRezef"), &state.ModulRezef},
                             {QStringLiteral("DchisaAmoka"), &state.DchisaAmoka},
                             {QStringLiteral("SugTzad"), &state.SugTzad},
                             {QStringLiteral("BranchChoice"), &state.BranchChoice},
                             {QStringLiteral("Shemot.n1"), &shemot.n1},
                             {QStringLiteral("Shemot.n2"), &shemot.n2},
                             {QStringLiteral("Shemot.n3"), &shemot.n3},
                             {QStringLiteral("Shemot.n4"), &shemot.n4},
                             {QStringLiteral("Shemot.Mail"), &shemot.Mail},
                             {QStringLiteral("Shemot.FillFit"), &shemot.FillFit},
                             {QStringLiteral("Shemot.Hearot"), &shemot.Hearot},
                             {QStringLiteral("Shemot.Bord"), &shemot.Bord},
                             {QStringLiteral("Shemot.ppr"), &shemot.ppr},
                             {QStringLiteral("Shemot.maat"), &shemot.maat},
                             {QStringLiteral("Shemot.ser"), &shemot.ser},
                             {QStringLiteral("Shemot.TotalPics"), &shemot.TotalPics},
                             {QStringLiteral("Shemot.Soog1"), &shemot.Soog1},
                             {QStringLiteral("Shemot.Soog2"), &shemot.Soog2},
                             {QStringLiteral("Shemot.CustomCode"), &shemot.CustomCode},
                             {QStringLiteral("Shemot.TimeOfJob"), &shemot.TimeOfJob},
                             {QStringLiteral("Shemot.Girsa"), &shemot.Girsa},
                             {QStringLiteral("ShemZalam"), &album.ShemZalam},
                             {QStringLiteral("ShemErooa"), &album.ShemErooa},
                             {QStringLiteral("TelZalam"), &album.TelZalam},
                             {QStringLiteral("MailZalam"), &album.MailZalam},
                             {QStringLiteral("SoogLBM"), &album.SoogLBM},
                             {QStringLiteral("SoogKricha"), &album.SoogKricha},
                             {QStringLiteral("SoogNiar"), &album.SoogNiar},
                             {QStringLiteral("GodelLBM"), &album.GodelLBM},
                             {QStringLiteral("HearotLBM"), &album.HearotLBM},
                             {QStringLiteral("KamutHorim"), &album.KamutHorim},
                             {QStringLiteral("SoogHorim"), &album.SoogHorim}};
    for (std::size_t i = 0; i < album.Tosafot1.size(); ++i)
        choices += {QStringLiteral("Tosafot1_%1").arg(i + 1), &album.Tosafot1[i]};
    for (std::size_t i = 0; i < album.Tosafot2.size(); ++i)
        choices += {QStringLiteral("Tosafot2_%1").arg(i + 1), &album.Tosafot2[i]};
    return choices;
}

struct AsText {
    QString operator()(const QString* text) const { return *text; }
    QString operator()(const std::int16_t* number) const { return QString::number(*number); }
    QString operator()(const bool* truth) const { return *truth ? QStringLiteral("-1") : QStringLiteral("0"); }
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
    return choices;
}

void TakeChoices(const QList<ListOutputEntry>& choices, SessionState& state) {
    const QList<Choice> known = choicesIn(state);
    for (const auto& [key, value] : choices) {
        for (const Choice& choice : known) {
            if (choice.key == key)
                std::visit(FromText{value}, choice.field);
        }
    }
}

} // namespace lumora
