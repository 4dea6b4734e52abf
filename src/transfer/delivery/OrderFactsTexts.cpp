#include "transfer/delivery/OrderFacts.h"

#include "common/PaperSize.h"
#include "order/AlbumChoices.h"
#include "order/ChoiceWords.h"
#include "order/OrderNames.h"
#include "session/SessionState.h"

#include <QTextBoundaryFinder>

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// A text that somebody has typed or chosen. The other two are the marks of the session and of a log that is missing.
QString told(const QString& text) {
    return text == u"***"_s || text == u"NO details"_s ? QString() : text.trimmed();
}

QString toldOf(const SessionState& state, QString AlbumDetails::*ofAlbum, QString OrderDetails::*ofOrder) {
    const QString text = told(state.shemot.*ofOrder);
    return text.isEmpty() && state.Optint == OrderKind::Album ? told(state.album.*ofAlbum) : text;
}

QString joined(QStringList parts) {
    parts.removeAll(QString());
    return parts.join(u", "_s);
}

QString borderText(const SessionState& state) {
    const QString& code = state.shemot.Bord;
    const QString words = borderWords(state, code);
    if (code == u"NB"_s)
        return words;
    if (code == u"WB"_s)
        return state.wording(u"מסגרת לבנה", u"white border");
    if (code == u"BK"_s)
        return state.wording(u"מסגרת שחורה", u"black border");
    if (!words.isEmpty())
        return state.wording(u"מסגרת %1 (%2)", u"border %1 (%2)").arg(code, words);
    const bool isBorder = code != u"NN"_s && !told(code).isEmpty();
    return isBorder ? state.wording(u"מסגרת %1", u"border %1").arg(code) : QString();
}

QString paperText(const SessionState& state) {
    const QString size = told(state.shemot.ppr);
    if (size == mixedSizes)
        return state.wording(u"גדלים שונים", u"several sizes");
    const QString whole = state.shemot.FillFit == u"FIT"_s
                              ? state.wording(u"התמונה כולה, בלי חיתוך", u"the whole picture, uncut")
                              : QString();
    return joined({size.isEmpty() ? size : state.wording(u"%1 ס\"מ", u"%1 cm").arg(size),
                   paperWord(state, told(state.shemot.maat)), borderText(state), whole});
}

// The order carries the Hebrew item, or the Hebrew prompt where none was taken.
QString albumWord(const SessionState& state, AlbumChoice choice, const QString& item) {
    if (const int row = orderedRow(choice, item); row >= 0)
        return albumItems(choice, state.english())[row].simplified();
    return item == albumPrompt(choice, false) ? QString() : told(item);
}

QString albumText(const SessionState& state) {
    const AlbumDetails& album = state.album;
    return joined(
        {albumWord(state, AlbumChoice::Kind, album.SoogLBM), albumWord(state, AlbumChoice::Size, album.GodelLBM),
         albumWord(state, AlbumChoice::Cover, album.SoogKricha), albumWord(state, AlbumChoice::Paper, album.SoogNiar)});
}

// The log of an order that is sent again does not tell it.
QString deliveryText(const SessionState& state) {
    if (state.transfer.SugMishloah != Sending::NewOrder)
        return {};
    if (state.MishloachHabaita || state.KodMishloach == u"HOM"_s)
        return joined({state.wording(u"משלוח עד הבית", u"to your home"), told(state.shemot.n3)});
    const auto branch = std::ranges::find_if(state.profile.Branches,
                                             [&](const Branch& one) { return one.caption == state.BranchChoice; });
    if (!state.BranchChoice.isEmpty())
        return branch == state.profile.Branches.end() || branch->name.isEmpty() ? state.BranchChoice : branch->name;
    if (state.KodMishloach == u"SOK"_s || state.KodMishloach == u"OSK"_s)
        return state.profile.Shops[state.KodMishloach == u"SOK"_s ? 0 : 1].name;
    return {};
}

// No line is cut where a word is longer than it.
QString breakable(const QString& text) {
    constexpr int longWord = 24;
    QString result;
    int letters = 0;
    QTextBoundaryFinder finder(QTextBoundaryFinder::Grapheme, text);
    for (qsizetype at = 0, next = finder.toNextBoundary(); next > at; at = next, next = finder.toNextBoundary()) {
        letters = text[at].isSpace() ? 0 : letters + 1;
        if (letters > longWord) {
            result += QChar(0x200B);
            letters = 1;
        }
        result += QStringView(text).sliced(at, next - at);
    }
    return result;
}

// The order keeps the branch behind the note, and the dash between them also without either.
QString noteText(const SessionState& state) {
    QString note = told(state.shemot.Hearot);
    for (const QString& end : {u"- "_s + state.BranchChoice, u"-"_s}) {
        if (note.endsWith(end)) {
            note.chop(end.size());
            break;
        }
    }
    return note.trimmed();
}

} // namespace

QList<OrderFact> OrderFacts(const SessionState& state) {
    const int prints = state.shemot.TotalPics;
    QList<OrderFact> facts{
        {state.wording(u"שם", u"Name"), toldOf(state, &AlbumDetails::ShemZalam, &OrderDetails::n1)},
        {state.wording(u"טלפון", u"Telephone"), GivenTelephone(state)},
        {state.wording(u"תמונות", u"Prints"), prints > 0 ? QString::number(prints) : QString()},
        {state.wording(u"נייר", u"Paper"), state.Optint == OrderKind::Album ? QString() : paperText(state)},
        {state.wording(u"אלבום", u"Album"), state.Optint == OrderKind::Album ? albumText(state) : QString()},
        {state.wording(u"אופן הקבלה", u"Delivery"), deliveryText(state)},
        {state.wording(u"הערה", u"Note"), noteText(state)}};
    for (OrderFact& fact : facts)
        fact.text = breakable(fact.text);
    facts.removeIf([](const OrderFact& fact) { return fact.text.isEmpty(); });
    return facts;
}

QString CalledName(const SessionState& state) {
    const QString name = toldOf(state, &AlbumDetails::ShemZalam, &OrderDetails::n1);
    return state.Optint == OrderKind::Album ? name : name.section(u' ', 0, 0, QString::SectionSkipEmpty);
}

QString GivenTelephone(const SessionState& state) {
    return toldOf(state, &AlbumDetails::TelZalam, &OrderDetails::n2);
}

QString ShortNumber(const QString& orderName) {
    QString number = OrderNumberOf(orderName);
    if (TravelsInPieces(number))
        number.chop(1);
    return number;
}

} // namespace lumora
