#include "selection/CardWords.h"

#include <QLocale>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QString countOf(const CardSummary& card, bool english) {
    if (card.pictures == 1 && !card.more)
        return english ? u"1 picture"_s : u"תמונה אחת"_s;
    const QString count = english ? u"%1 pictures"_s : u"%1 תמונות"_s;
    const QString more = english ? u"more than %1 pictures"_s : u"יותר מ-%1 תמונות"_s;
    return (card.more ? more : count).arg(card.pictures);
}

QString newestOf(QDate day, QDate today, bool english) {
    const qint64 ago = day.daysTo(today);
    if (ago == 0)
        return english ? u"newest today"_s : u"החדשה מהיום"_s;
    if (ago == 1)
        return english ? u"newest yesterday"_s : u"החדשה מאתמול"_s;
    return (english ? u"newest %1"_s : u"החדשה מ-%1"_s).arg(day.toString(u"d.M.yyyy"_s));
}

} // namespace

QString mediumWords(const Medium& medium, bool english) {
    switch (medium.kind) {
    case Medium::Kind::SdCard:
        return english ? u"SD card"_s : u"כרטיס SD"_s;
    case Medium::Kind::Card:
        return english ? u"Memory card"_s : u"כרטיס זיכרון"_s;
    case Medium::Kind::Stick:
        return english ? u"USB stick"_s : u"התקן USB"_s;
    case Medium::Kind::Other:
        break;
    }
    return !medium.label.isEmpty() ? medium.label : english ? u"Card or stick"_s : u"כרטיס או התקן USB"_s;
}

QString withLabel(const QString& words, const QString& label) {
    return label.isEmpty() || label == words ? words : words + u" · \u2068"_s + label + QChar(0x2069);
}

CardWords cardWords(const Cards::Card& card, QDate today, bool english) {
    CardWords words{mediumWords(card.medium, english), {}, false};
    if (!card.summary)
        words.note = english ? u"counting the pictures…"_s : u"סופר את התמונות…"_s;
    else if (!card.summary->readable)
        words.note = english ? u"can't be read"_s : u"לא ניתן לקריאה"_s;
    else if (card.summary->pictures == 0)
        words.note = english ? u"no pictures"_s : u"אין תמונות"_s;
    else
        words = {words.head,
                 countOf(*card.summary, english) + u" · "_s + newestOf(card.summary->newest, today, english), true};
    return words;
}

QString copyWords(const CopyCount& count, bool english) {
    if (count.missing == 1)
        return english ? u"1 picture is missing: please put the card in again"_s
                       : u"תמונה אחת חסרה: נא להכניס שוב את הכרטיס"_s;
    if (count.missing > 0)
        return (english ? u"%1 pictures are missing: please put the card in again"_s
                        : u"%1 תמונות חסרות: נא להכניס שוב את הכרטיס"_s)
            .arg(count.missing);
    if (count.waiting > 0)
        return (english ? u"Please leave the card in: %1 of %2 copied"_s : u"נא להשאיר את הכרטיס: הועתקו %1 מתוך %2"_s)
            .arg(count.kept)
            .arg(count.kept + count.waiting + count.onCard);
    if (count.onCard > 0)
        return english ? u"Please leave the card in"_s : u"נא להשאיר את הכרטיס"_s;
    return !count.isIn ? QString() : english ? u"You may take the card out now"_s : u"אפשר להוציא את הכרטיס עכשיו"_s;
}

CardWords noCardWords(bool english) {
    return {english ? u"Put in a memory card or a stick, and it shows here"_s
                    : u"כרטיס זיכרון או התקן USB שיוכנס יופיע כאן"_s,
            {},
            false};
}

CardWords openedCardWords(bool english) {
    return {english ? u"The card is open"_s : u"הכרטיס פתוח"_s, {}, false};
}

QString dayWords(QDate day, QDate today, bool english) {
    const QLocale language(english ? QLocale::English : QLocale::Hebrew);
    const QString date =
        english ? language.toString(day, u"dddd, d MMMM yyyy"_s) : language.toString(day, u"dddd, d בMMMM yyyy"_s);
    const qint64 ago = day.daysTo(today);
    if (ago == 0)
        return (english ? u"Today"_s : u"היום"_s) + u" · "_s + date;
    if (ago == 1)
        return (english ? u"Yesterday"_s : u"אתמול"_s) + u" · "_s + date;
    return date;
}

} // namespace lumora
