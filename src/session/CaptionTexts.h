#pragma once

#include "session/Caption.h"
#include "session/SessionState.h"

#include <initializer_list>

namespace lumora {

// One line of a page's table of texts.
struct CaptionText {
    Caption& caption;
    const char16_t* hebrew;
    const char16_t* english = hebrew;     // where it is left out, the same in both
    const char16_t* hebrewHint = nullptr; // where both are left out, the hint stays as it is
    const char16_t* englishHint = hebrewHint;
};

// A text of the table that belongs to no caption: what is spoken of a control.
struct WordingText {
    QString& text;
    const char16_t* hebrew;
    const char16_t* english = hebrew;
};

// Sets each caption of the table to its text and its hint in the language of the session.
inline void setCaptions(const SessionState& state, std::initializer_list<CaptionText> texts) {
    for (const CaptionText& text : texts) {
        text.caption.text = state.wording(text.hebrew, text.english);
        if (text.hebrewHint != nullptr)
            text.caption.hint = state.wording(text.hebrewHint, text.englishHint);
    }
}

inline void setWordings(const SessionState& state, std::initializer_list<WordingText> texts) {
    for (const WordingText& text : texts)
        text.text = state.wording(text.hebrew, text.english);
}

} // namespace lumora
