#pragma once

#include "platform/media/Cards.h"

#include <QDate>
#include <QString>

namespace lumora {

// How a card or a stick is offered (CardWordsTexts.cpp).
struct CardWords {
    QString head;       // "SD card"
    QString note;       // "214 pictures · newest today"
    bool opens = false; // it holds pictures
};

CardWords cardWords(const Cards::Card& card, QDate today, bool english);
// "SD card"; of a medium that is not known its label, where it has one.
QString mediumWords(const Medium& medium, bool english);
// Where there are several of one name.
QString withLabel(const QString& words, const QString& label);
// How far the copying of what was chosen from cards has come.
struct CopyCount {
    qsizetype kept = 0;
    qsizetype waiting = 0;
    qsizetype missing = 0; // a card was pulled too early
    qsizetype onCard = 0;  // can't be copied, and is read from the card
    bool isIn = false;     // a card with one that is kept
};
// Empty where there is nothing to tell.
QString copyWords(const CopyCount& count, bool english);
// Where no card is in.
CardWords noCardWords(bool english);
// All that is in is on the page.
CardWords openedCardWords(bool english);
// A day as customers say it.
QString dayWords(QDate day, QDate today, bool english);

} // namespace lumora
