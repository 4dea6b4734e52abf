#include "order/ChoiceWords.h"

#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct BorderText {
    const char16_t* code;
    const char16_t* hebrew;
    const char16_t* english;
};

// As the samples of the details page are drawn.
constexpr BorderText borderTexts[] = {
    {u"NB", u"ללא מסגרת", u"no border"},
    {u"WB", u"לבנה", u"white"},
    {u"B7", u"שחורה, צרה", u"black, narrow"},
    {u"BB", u"שחורה, רחבה", u"black, wide"},
    {u"BB1", u"לבנה, קו שחור דק", u"white, thin black line"},
    {u"BB2", u"לבנה, קו שחור עבה", u"white, thick black line"},
    {u"CA1", u"קרם", u"cream"},
    {u"CA9", u"חומה", u"brown"},
    {u"BL1", u"כחולה", u"blue"},
    {u"FA9", u"קווים זהובים", u"golden lines"},
};

} // namespace

QString borderWords(const SessionState& state, const QString& code) {
    for (const BorderText& text : borderTexts) {
        if (code == QStringView(text.code))
            return state.wording(text.hebrew, text.english);
    }
    return {};
}

QString paperWord(const SessionState& state, const QString& maat) {
    if (maat == u"מט"_s || maat == u"Matte"_s)
        return state.wording(u"מט", u"Matte");
    if (maat == u"מבריק"_s || maat == u"Glossy"_s)
        return state.wording(u"מבריק", u"Glossy");
    return maat;
}

} // namespace lumora
