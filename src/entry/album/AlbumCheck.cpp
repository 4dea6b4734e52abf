#include "entry/album/AlbumCheck.h"

#include "common/FixedText.h"
#include "entry/details/DetailsCheck.h"
#include "order/AlbumChoices.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

std::optional<AlbumProblem> CheckAlbum(const SessionState& state, const QString& mailName) {
    using Place = AlbumProblem::Place;
    const AlbumDetails& album = state.album;
    const auto prompt = [&](AlbumChoice choice) { return orderedItem(choice, -1); };
    // This text is one letter shorter than the list's prompt, so that a list without a choice passes and the prompt is
    // sent as the paper.
    const QString untouchedPaper = u"בחר סוג ניר"_s;
    const struct {
        bool missing;
        Place place;
        QString message;
    } checks[] = {
        {album.ShemZalam.isEmpty(), Place::Name,
         state.wording(u"לא כתבת שם צלם", u"Please insert the photographer's name")},
        {album.TelZalam.isEmpty(), Place::Telephone, detailsMessage(DetailsMessage::NoTelephone, state.english())},
        {album.ShemErooa.isEmpty(), Place::Event,
         state.wording(u"לא כתבת שם אירוע", u"Please insert the name of the event")},
        {mailName.trimmed().isEmpty(), Place::Mail,
         state.wording(u"לא כתבת דואר אלקטרוני", u"Please insert your mail address")},
        {album.SoogLBM == notChosen, Place::Kind, state.wording(u"לא בחרת סוג אלבום", u"Please choose an album kind")},
        {album.GodelLBM == prompt(AlbumChoice::Size), Place::Size,
         state.wording(u"לא בחרת גודל אלבום", u"Please choose an album size")},
        {album.SoogKricha == prompt(AlbumChoice::Cover), Place::Cover,
         state.wording(u"לא בחרת סוג כריכה", u"Please choose a cover")},
        {album.SoogNiar == untouchedPaper, Place::Paper, state.wording(u"לא בחרת סוג ניר", u"Please choose a paper")},
    };
    for (const auto& check : checks) {
        if (check.missing)
            return AlbumProblem{check.message, check.place};
    }
    return std::nullopt;
}

std::optional<QString> checkParentAlbum(const SessionState& state, int copies, bool chosen) {
    if (copies == 0 || chosen)
        return std::nullopt;
    return state.wording(u"בחר סוג אלבום הורים\nאו שתבטל הוספת אלבום הורים\nעל ידי הורדת עותקים לאפס",
                         u"Please choose the kind of the parent album\nor take the parent album out\n"
                         u"by bringing its copies down to zero");
}

void takeAlbumOrder(SessionState& state) {
    QString& extra = state.album.Tosafot1[0];
    if (extra == orderedItem(AlbumChoice::Extra, -1))
        extra.clear();
    state.Optint = OrderKind::Album;
    state.shemot.ppr = state.album.GodelLBM;
    state.shemot.FillFit = u"FFF"_s;
    state.shemot.Bord = u"NB"_s;
    state.shemot.maat = u"M"_s;
}

} // namespace lumora
