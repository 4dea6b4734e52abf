#include "entry/album/AlbumCheck.h"

#include "common/DrivePathText.h"
#include "entry/album/AlbumChoices.h"
#include "entry/details/DetailsCheck.h"
#include "session/SessionState.h"

namespace lumora {

std::optional<AlbumProblem> CheckAlbum(const SessionState& state, const QString& mailName) {
    using Place = AlbumProblem::Place;
    const AlbumDetails& album = state.album;
    const auto prompt = [&](AlbumChoice choice) { return albumPrompt(choice, state.english()); };
    // One letter less than the list's prompt, on purpose: an untouched list passes, and the prompt goes out as the
    // paper.
    const QString untouchedPaper = QStringLiteral("בחר סוג ניר");
    const struct {
        bool missing;
        Place place;
        const char16_t* hebrew;
        const char16_t* english;
    } checks[] = {
        {album.ShemZalam.isEmpty(), Place::Name, u"לא כתבת שם צלם", u"Please insert the photographer's name"},
        {album.TelZalam.isEmpty(), Place::Telephone, nullptr, nullptr},
        {album.ShemErooa.isEmpty(), Place::Event, u"לא כתבת שם אירוע", u"Please insert the name of the event"},
        {mailName.trimmed().isEmpty(), Place::Mail, u"לא כתבת דואר אלקטרוני", u"Please insert your mail address"},
        {album.SoogLBM == notChosen, Place::Kind, u"לא בחרת סוג אלבום", u"Please choose an album kind"},
        {album.GodelLBM == prompt(AlbumChoice::Size), Place::Size, u"לא בחרת גודל אלבום",
         u"Please choose an album size"},
        {album.SoogKricha == prompt(AlbumChoice::Cover), Place::Cover, u"לא בחרת סוג כריכה", u"Please choose a cover"},
        {album.SoogNiar == untouchedPaper, Place::Paper, u"לא בחרת סוג ניר", u"Please choose a paper"},
    };
    for (const auto& check : checks) {
        if (!check.missing)
            continue;
        const QString message =
            check.hebrew ? state.wording(check.hebrew, check.english) : detailsMessages(state.english())[6];
        return AlbumProblem{message, check.place};
    }
    return std::nullopt;
}

std::optional<QString> checkParentAlbum(const SessionState& state, const QString& copies, bool chosen) {
    if (copies == u"0" || chosen)
        return std::nullopt;
    return state.wording(
        QStringLiteral("בחר סוג אלבום הורים\nאו שתבטל הוספת אלבום הורים\nעל ידי הורדת עותקים לאפס"),
        QStringLiteral("Please choose the kind of the parent album\nor take the parent album out\nby bringing its "
                       "copies down to zero"));
}

void takeAlbumOrder(SessionState& state) {
    QString& extra = state.album.Tosafot1[0];
    if (extra == albumPrompt(AlbumChoice::Extra, state.english()))
        extra.clear();
    state.Optint = OrderKind::Album;
    state.shemot.ppr = state.album.GodelLBM;
    state.shemot.FillFit = QStringLiteral("FFF");
    state.shemot.Bord = QStringLiteral("NB");
    state.shemot.maat = QStringLiteral("M");
}

} // namespace lumora
