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
// Where no card is in.
CardWords noCardWords(bool english);
// A day as customers say it.
QString dayWords(QDate day, QDate today, bool english);

} // namespace lumora
