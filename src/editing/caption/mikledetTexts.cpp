// What the caption's keyboard says.
#include "editing/caption/mikledet.h"
#include "session/CaptionTexts.h"

namespace lumora {

void mikledet::setTexts() {
    setCaptions(m_state, {
                             {Title, u"מקלדת", u"Keyboard"},
                             {Command1, u"Space  רווח", u"Space"},
                             {Command4, u"ע"},
                             {Command9, u"e"},
                             {Command2, u"E"},
                             {Command5, u"עוד", u"More"},
                             {Command7, u"Enter"},
                             {Command6, u"נקה Clear", u"Clear"},
                             {Command8, u"הסר טקסט מתמונה הזו", u"Remove this text"},
                             {Command10, u"רשימת גופנים", u"Font list"},
                             {Command13, u"הודעות מוכנות", u"Ready messages"},
                             {Command14, u"מקלדת", u"Keyboard"},
                             {CommandDone, u"סיום", u"Done"},
                             {Check4, u"הצג טקסט", u"Show text"},
                         });
    setWordings(m_state, {
                             {Command3.hint, u"מחק את האות האחרונה", u"Take back the last letter"},
                             {Image1.hint, u"הגדל את האותיות", u"Larger letters"},
                             {Image2.hint, u"הקטן את האותיות", u"Smaller letters"},
                             {Image3.hint, u"רגיל, מודגש, נטוי", u"Regular, bold, italic"},
                             {Image4.hint, u"לרוחב או לאורך", u"Across or down"},
                             {Image15[0].hint, u"הזז שמאלה", u"Move left"},
                             {Image15[1].hint, u"הזז ימינה", u"Move right"},
                             {Image15[2].hint, u"הזז למעלה", u"Move up"},
                             {Image15[3].hint, u"הזז למטה", u"Move down"},
                             {Image5[0].hint, u"הטקסט מתחיל בנקודה", u"The text begins at its point"},
                             {Image5[1].hint, u"הטקסט ממורכז בנקודה", u"The text is centred on its point"},
                             {Image5[2].hint, u"הטקסט מסתיים בנקודה", u"The text ends at its point"},
                             {Picture18.hint, u"צבע הטקסט", u"Colour of the text"},
                             {words.text, u"הטקסט שעל התמונה", u"The text on the picture"},
                             {words.hebrewLetters, u"אותיות בעברית", u"Hebrew letters"},
                             {words.smallLetters, u"אותיות קטנות באנגלית", u"Small letters"},
                             {words.capitalLetters, u"אותיות גדולות באנגלית", u"Capital letters"},
                             {words.blankKey, u"רווח", u"Space"},
                         });
    relabel(letters);
}

} // namespace lumora
