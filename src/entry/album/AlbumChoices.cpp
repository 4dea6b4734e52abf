#include "entry/album/AlbumChoices.h"

namespace lumora {

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
        return {u" בחר סוג אלבום"_qs,
                u"Choose the album kind"_qs,
                {u"אינדיגו  סבתא"_qs, u"אינדיגו  ספירלה"_qs, u"אינדיגו הורים"_qs, u"אינדיגו גדול"_qs, u"פוטו הורים"_qs,
                 u"פוטו גדול"_qs},
                {u"Indigo grandma"_qs, u"Indigo spiral"_qs, u"Indigo parents"_qs, u"Indigo large"_qs,
                 u"Photo parents"_qs, u"Photo large"_qs}};
    case AlbumChoice::ParentSize:
        return {u"סוג אלבום הורים"_qs,
                u"Parent album kind"_qs,
                {u"20/40"_qs, u"20/54"_qs, u"25/50"_qs, u"30/40"_qs, u"30/60"_qs},
                {}};
    case AlbumChoice::Size:
        return {u"בחר גודל אלבום"_qs,
                u"Choose the album size"_qs,
                {u"20/54"_qs, u"30/45"_qs, u"30/60"_qs, u"30/80"_qs, u"40/60"_qs, u"40/80"_qs},
                {}};
    case AlbumChoice::Cover:
        return {u"בחר סוג כריכה"_qs, u"Choose the cover"_qs, {u"חום"_qs, u"קרם"_qs}, {u"Brown"_qs, u"Cream"_qs}};
    case AlbumChoice::Paper:
        return {u"בחר סוג נייר"_qs,
                u"Choose the paper"_qs,
                {u"מבריק"_qs, u"מט"_qs, u"משי"_qs},
                {u"Glossy"_qs, u"Matte"_qs, u"Silk"_qs}};
    case AlbumChoice::Extra:
        return {u"בחר תוספת"_qs,
                u"Choose an extra"_qs,
                {u"ללא"_qs, u"קנבס"_qs, u"פלטה- סובלימציה"_qs, u"פרספקט"_qs},
                {u"None"_qs, u"Canvas"_qs, u"Sublimation plate"_qs, u"Perspex"_qs}};
    case AlbumChoice::SpecialExtra:
        return {
            u"  תוספות מיוחדות"_qs,
            u"Special extras"_qs,
            {u"עוד"_qs, u"הטבעת שם בכריכה"_qs, u"פינות עגולות"_qs, u"מזוודה"_qs, u"סובלימציה"_qs, u"פתיחה אנגלית"_qs},
            {u"More"_qs, u"Name on the cover"_qs, u"Round corners"_qs, u"Case"_qs, u"Sublimation"_qs,
             u"English opening"_qs}};
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

} // namespace lumora
