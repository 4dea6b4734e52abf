#pragma once

#include "session/Caption.h"
#include "session/SessionState.h"

#include <initializer_list>

namespace lumora {

// One line of a page's table of texts.
struct CaptionText {
    Caption& caption;
    const char16_t* hebrew;
    const char16_t* english;
};

// Every caption of the table says its text in the language of the session.
inline void setCaptions(const SessionState& state, std::initializer_list<CaptionText> texts) {
    for (const CaptionText& text : texts)
        text.caption.text = state.wording(text.hebrew, text.english);
}

} // namespace lumora
