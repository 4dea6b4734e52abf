#include "order/AlbumChoices.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct AlbumList {
    QString prompt;
    QString englishPrompt;
    QStringList items;
    QStringList englishItems; // empty: the same in both languages
};

AlbumList listOf(AlbumChoice choice) {
    switch (choice) {
    case AlbumChoice::Kind:
        return {u" בחר סוג אלבום"_s,
                u"Choose the album kind"_s,
                {u"אינדיגו  סבתא"_s, u"אינדיגו  ספירלה"_s, u"אינדיגו הורים"_s, u"אינדיגו גדול"_s, u"פוטו הורים"_s,
                 u"פוטו גדול"_s},
                {u"Indigo grandma"_s, u"Indigo spiral"_s, u"Indigo parents"_s, u"Indigo large"_s, u"Photo parents"_s,
                 u"Photo large"_s}};
    case AlbumChoice::ParentSize:
        return {u"סוג אלבום הורים"_s,
                u"Parent album kind"_s,
                {u"20/40"_s, u"20/54"_s, u"25/50"_s, u"30/40"_s, u"30/60"_s},
                {}};
    case AlbumChoice::Size:
        return {u"בחר גודל אלבום"_s,
                u"Choose the album size"_s,
                {u"20/54"_s, u"30/45"_s, u"30/60"_s, u"30/80"_s, u"40/60"_s, u"40/80"_s},
                {}};
    case AlbumChoice::Cover:
        return {u"בחר סוג כריכה"_s, u"Choose the cover"_s, {u"חום"_s, u"קרם"_s}, {u"Brown"_s, u"Cream"_s}};
    case AlbumChoice::Paper:
        return {u"בחר סוג נייר"_s,
                u"Choose the paper"_s,
                {u"מבריק"_s, u"מט"_s, u"משי"_s},
                {u"Glossy"_s, u"Matte"_s, u"Silk"_s}};
    case AlbumChoice::Extra:
        return {u"בחר תוספת"_s,
                u"Choose an extra"_s,
                {u"ללא"_s, u"קנבס"_s, u"פלטה- סובלימציה"_s, u"פרספקט"_s},
                {u"None"_s, u"Canvas"_s, u"Sublimation plate"_s, u"Perspex"_s}};
    case AlbumChoice::SpecialExtra:
        return {
            u"  תוספות מיוחדות"_s,
            u"Special extras"_s,
            {u"עוד"_s, u"הטבעת שם בכריכה"_s, u"פינות עגולות"_s, u"מזוודה"_s, u"סובלימציה"_s, u"פתיחה אנגלית"_s},
            {u"More"_s, u"Name on the cover"_s, u"Round corners"_s, u"Case"_s, u"Sublimation"_s, u"English opening"_s}};
    }
    return {};
}

} // namespace

QString albumPrompt(AlbumChoice choice, bool english) {
    const AlbumList list = listOf(choice);
    return english ? list.englishPrompt : list.prompt;
}

QStringList albumItems(AlbumChoice choice, bool english) {
    const AlbumList list = listOf(choice);
    return english && !list.englishItems.isEmpty() ? list.englishItems : list.items;
}

QString orderedItem(AlbumChoice choice, int row) {
    const AlbumList list = listOf(choice);
    return list.items.value(row, list.prompt);
}

int orderedRow(AlbumChoice choice, const QString& item) {
    return static_cast<int>(listOf(choice).items.indexOf(item));
}

} // namespace lumora
