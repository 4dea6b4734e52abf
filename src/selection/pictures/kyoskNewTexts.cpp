// All texts of the page of pictures, in both languages.
#include "order/MailAddressGuard.h"
#include "selection/pictures/kyoskNew.h"
#include "session/CaptionTexts.h"
#include "session/SessionState.h"
#include "session/lab/MailDomains.h"

#include <algorithm>
#include <cmath>

namespace lumora {

using namespace Qt::StringLiterals;

void kyoskNew::setTexts() {
    setBrowserTexts();
    setClosingTexts();
    showGuide(m_guide);
    if (m_grade != PrintGrade::Unmarked)
        Label6.text = printGradeText(m_grade, m_gradedSize, m_state.english());
    setPaperTexts();
    nameBranches();
    showCards();
    if (m_countShown)
        showPictureCount();
    showChoice();
}

void kyoskNew::setBrowserTexts() {
    Label15.text = Label18.text = m_state.shemot.ppr;
    changeDetails.visible = mayChangeDetails();
    if (plain())
        setCaptions(m_state, {{Title, u"בחירת תמונות", u"Choose your pictures"}});
    else
        setCaptions(m_state, {{Title, u"יש ללחוץ על תמונה כדי לערוך אותה", u"Tap a picture to edit it"}});
    setCaptions(
        m_state,
        {
            {Frame1, u"כאן יוצגו התמונות\nיש ללחוץ על הוספת תמונות ולבחור תמונה אחת מהתיקייה",
             u"Your pictures will show here\nPress Add pictures and select one picture of the folder"},
            {Label7Prompt, u"עותקים", u"Copies"},
            {Label34Prompt, u"תמונות בתיקייה", u"Pictures found"},
            {Label25, u"זכור\nעליך לבחור רק תמונה אחת\nוהתוכנה תציג את כל התמונות ",
             u"Please Be Note\nSelect one image only\nand the program will Show \nall the Chocen Folder Images"},
            {Image4, u"סובב", u"Turn", u"סובב את התצוגה. ההדפסה אינה משתנה",
             u"Turns the view only; the print does not change"},
            {Image5, u"הוסף תמונות", u"Add pictures", u"הוסף תמונות מתיקייה נוספת",
             u"Adds the pictures of a further folder"},
            {Command4Safa, u"English", u"עברית"},
            {Image6, u"עזרה", u"Help"},
            {Image7, u"סיים ושלח", u"Finish Order And Send"},
            {Image8, u"בטל בחירה בדף זה", u"Cancel this page", u"מבטל את כל התמונות שנבחרו בדף זה",
             u"Cancels all pictures chosen on this page"},
            {Image10, u"יציאה", u"Leave"},
            {Image11, u"מחירון", u"Price list"},
            {Image13, u"סיים ושלח", u"Finish Order And Send", u"סיום הזמנת האלבום", u"Finishes the album order"},
            {Image15, u"הקודמות", u"Previous", u"תמונות קודמות", u"Previous pictures"},
            {Image16, u"הבאות", u"Next", u"תמונות הבאות", u"Next pictures"},
            {Image17, u"מחירון", u"Price list"},
            {changeDetails, u"שינוי", u"Change"},
            {Image23, u"סגור את התוכנה", u"End the program"},
            {Command11, u"הסר כפילויות", u"Drop duplicates", u"תמונה שנבחרה פעמיים תופיע פעם אחת",
             u"A picture that stands twice in the basket will stand once"},
            {Command14, u"הצג רק מה שנבחר", u"Show only what was chosen"},
            {copiesHead, u"כמה עותקים?", u"How many copies?"},
            {copiesBack, u"", u"", u"מחק ספרה", u"Take back a digit"},
            {copiesCancel, u"ביטול", u"Cancel"},
            {copiesDone, u"אישור", u"OK"},
            {emptyHead, u"מאיפה ניקח את התמונות?", u"Where are your pictures?"},
            {firstFolder, u"פתח תיקיית תמונות", u"Open a folder of pictures"},
            {doorNote, u"מכינים את התמונות שבחרתם", u"Making your pictures ready"},
            {doorBack, u"חזרה לתמונות", u"Back to the pictures"},
            {Frame2, u"עזרה", u"Help"},
            {helpClose, u"סגור", u"Close"},
            {Picture66, u"שליחת תיקייה שלמה", u"Send a whole folder"},
            {Label35, u"האם לשלוח את כל התיקייה?", u"Send the whole folder?"},
            {Label36, u"יש לבחור כאן כיצד להמשיך", u"Choose here how to go on"},
            {Command24, u"מעוניין לשלוח את כל התיקייה במלואה", u"I want to send the whole folder"},
            {Command25, u"לא את כל התיקייה, אבחר בעצמי", u"Not all of it, I will choose"},
            {Command23, u"התחרטתי רוצה לשלוח תיקייה אחרת ", u"Changed my mind, I want another folder"},
            {Command26[0], u"כן", u"Yes"},
            {Command26[1], u"לא", u"No"},
        });
    for (SpokenCaption& plus : Command12)
        setCaptions(m_state, {{plus, u"+", u"+", u"עותק נוסף", u"One copy more"}});
    for (SpokenCaption& minus : Command13)
        setCaptions(m_state, {{minus, u"−", u"−", u"עותק פחות, או ביטול הבחירה", u"One copy less, or not at all"}});
    for (std::size_t digit = 0; digit < copiesDigit.size(); ++digit)
        copiesDigit[digit].text = QString::number(digit);
    showEntry();
    Picture2.warning =
        m_state.wording(u"מעט פיקסלים: ההדפסה עלולה לצאת מטושטשת", u"Few pixels: the print may come out blurred");
    Picture2.spoken = m_state.wording(u"הצגת התמונה בגדול", u"Look at the picture in large");
    Label9.text = (plain() ? m_state.wording(u"לחיצה על תמונה קטנה בוחרת אותה ומציגה אותה בגדול\n",
                                             u"A click on a small picture chooses it and shows it large\n")
                           : m_state.wording(u"לחיצה על תמונה קטנה בוחרת אותה ופותחת אותה לעריכה\n",
                                             u"A click on a small picture chooses it and opens it for editing\n")) +
                  m_state.wording(u"פלוס ומינוס קובעים את מספר העותקים\n"
                                  u"תמונה של פחות ממיליון פיקסלים מציגה אזהרה על איכות נמוכה",
                                  u"Plus and minus set the number of copies\n"
                                  u"A picture of under a million pixels shows a warning of low quality");
    if (m_resolution.paper())
        Label9.text +=
            m_state.wording(u"\nהסימן שעל תמונה אומר כמה נקודות לאינץ' יהיו לה על הנייר שנבחר:\n"
                            u"מ-200 dpi היא חדה, מ-120 dpi סבירה, ומתחת לכך מפוקסלת",
                            u"\nThe mark on a picture tells its dots per inch on the paper that was chosen:\n"
                            u"from 200 dpi on it is sharp, from 120 dpi on fair, and below that coarse");

    const QString once = m_state.wording(u"יש לבחור רק תמונה אחת", u"Select one image only");
    const QString all =
        m_state.wording(u"והתוכנה תציג לפניך את כל התמונות", u"and the program will show you all the images");
    const QString fromFolder =
        m_state.wording(u"יש לבחור רק תמונה אחת מתוך תקייה", u"Select only one image of a folder");
    Pic4BroseLines = {once, all, fromFolder, once, all, fromFolder};
    Pic4Brose.text = once;
}

void kyoskNew::setClosingTexts() {
    setCaptions(
        m_state,
        {
            {Frame3, u"יציאה", u"Leaving"},
            {Label11,
             u"בחרת תמונות למשלוח והנך מבקש לצאת\n"
             u"אם ברצונך לצאת לחץ על יציאה\n"
             u"אם ברצונך לשלוח את התמונות להדפסה\n"
             u"לחץ על סיים ושלח",
             u"You have chosen to leave this program,\n"
             u"but you did select images.\n"
             u"In case you want leave press EXIT.\n"
             u"If you want to send the images,\n"
             u"to be printed\n"
             u"Please press the button \n"
             u"''Finish Order And Send''"},
            {Command15, u"יציאה", u"EXIT"},
            {Command4, u"סגור חלון זה", u"Close this window"},
            {Frame4, u"סיום הבחירה", u"Your order"},
            {closingHead, u"כמעט סיימנו", u"Almost done"},
            {Label19Prompt, u"גודל נייר", u"Paper size"},
            {Label20Prompt, u"עותקים", u"Copies"},
            {Label17, u"כתובת דואר אלקטרוני", u"E-mail address"},
            {Label33, u"דואר אלקטרוני שדה חובה", u"E-mail is a required field"},
            {Text2Prompt, u"הערות", u"Notes"},
            {LblKoopon, u" אם יש ברשותך מנוי או קופון הנחה \r\n רצוי שתרשום את מספרו \r\n בחלונית ההערות ",
             u" If you hold a subscription or a discount coupon \r\n please write its number \r\n in the notes box "},
            {Label4kpn3Prompt, u"תמונות בקופון", u"Pictures in the coupon"},
            {showCoarse, u"הצג אותן", u"Show them"},
            {Command8, u"המשך", u"Continue"},
            {Command10, u"חזור לדף בחירת תמונות ", u"Back to the pictures"},
            {Pic4snifim, u"בחר סניף שבו תרצה לקבל את התמונות", u"Choose the branch where you want to get the pictures"},
            {Image33, u"בחר סניף", u"Choose a branch"},
            {Command28, u"סגור", u"Close"},
            {Picture7, u"דחיסת תמונות גדולות", u"Compression of large prints"},
            {Label37, u"האם להעמיק את דחיסת התמונות? המשלוח יהיה מהיר יותר",
             u"Compress the pictures more deeply? They will be sent faster"},
            {Command20, u"לא להעמיק דחיסה", u"Do not compress deeper"},
            {Command21, u"כן להעמיק דחיסה", u"Compress deeper"},
        });
    setCoarseTexts();
    showAddressWord();
    Combo1.spoken = m_state.wording(u"ספק הדואר, אחרי השטרודל", u"Mail provider, behind the at sign");
    if (m_promptStands)
        Combo1.text = mailDomainPrompt(m_state.english());
    Label4kpn3.text = QString::number(m_state.coupon.MisparKoopon);
    if (m_state.TachanaMekomit)
        setCaptions(m_state, {{Command7, u"המשך", u"Continue"}});
    else
        setCaptions(m_state, {{Command7, u"המשך ללא כתובת דואר", u"Continue without my address"}});
}

void kyoskNew::showRange() {
    const auto range = m_choice.range();
    pageRange.visible = range.has_value();
    if (!range)
        return;
    const QString numbers = range->count == 1 ? QString::number(range->start + 1)
                                              : u"%1-%2"_s.arg(range->start + 1).arg(range->start + range->count);
    pageRange.text = (range->of == SeenPages::Of::Folders ? m_state.wording(u"%1 מתוך %2", u"%1 of %2")
                                                          : m_state.wording(u"%1 מתוך %2 שנבחרו", u"%1 of %2 chosen"))
                         .arg(numbers)
                         .arg(range->all);
}

bool kyoskNew::addressTyped() const {
    if (addressBox() == AddressBox::AlbumMail)
        return !Txt4Ml2.text.trimmed().isEmpty();
    return MailAddressGuard::isComplete(typedAddress());
}

// Nobody is held up by the address: there is always a button to go on without it.
void kyoskNew::showAddressWord() {
    if (addressTyped())
        setCaptions(m_state, {{Label33Word, u"✓ הוקלד", u"✓ filled in"}});
    else
        setCaptions(m_state, {{Label33Word, u"אפשר להמשיך גם בלעדיו", u"you can also go on without it"}});
}

void kyoskNew::showGuide(Guide guide) {
    m_guide = guide;
    const auto lines = [this](const char16_t* hebrew, const char16_t* english) {
        return m_state.wording(hebrew, english).split(u'\n');
    };
    switch (guide) {
    case Guide::None:
        return;
    case Guide::PicturesShown:
        Picture2.guide =
            lines(u"   בצד שמאל תמונות קטנות", u"   The small pictures are beside this") +
            (plain() ? lines(u"   אם לחצת על תמונה אז בחרת אותה ", u"   Press a picture to choose it ")
                     : lines(u"   אם לחצת על תמונה אז היא נפתחת לעריכה ", u"   Press a picture to edit it ")) +
            lines(u"   רוצה לבטל בחירה אז לחץ על לחצן מינוס ", u"   To cancel a choice press the minus button ") +
            lines(u"<<<<<<<<<<<<<<", u"<<<<<<<<<<<<<<");
        break;
    case Guide::ChooseByHand:
        Picture2.guide =
            lines(u"הנך מוזמן לבחור תמונות\nמצד שמאל תמונות קטנות\nלחצת על תמונה בחרת אותה להדפסה\n"
                  u"מקשי הפלוס והמינוס נועדו להוספה או ביטול",
                  u"Please choose your pictures\nThe small pictures are beside this\n"
                  u"Press a picture to choose it for print\nThe plus and minus keys add copies and cancel");
        break;
    }
    Picture2.text = Picture2.guide.join(u'\n');
    Picture2.bitmap = Bitmap();
    Picture2.poor = false;
    Image4.visible = false;
    showPaper();
}

void kyoskNew::setPaperTexts() {
    // A paper that differs from the picture by less than this share cuts nothing that is seen.
    constexpr double unseen = 0.005;
    const QRectF& paper = Picture2.paper;
    paperNote.visible = !paper.isNull();
    largeResolution.show(paper.isNull() ? std::nullopt : m_resolution.of(m_largeSize, {}), m_state.shemot.ppr,
                         m_state.english());
    if (std::max(std::abs(paper.width() - 1), std::abs(paper.height() - 1)) < unseen)
        setCaptions(m_state,
                    {{paperNote, u"תודפס כולה (בערך, המעבדה חותכת)", u"All of it prints (about, the lab cuts)"}});
    else if (m_resolution.fit() == PaperFit::Fill)
        setCaptions(m_state,
                    {{paperNote, u"הכהה ייחתך (בערך, המעבדה חותכת)", u"Shaded: cut off (about, the lab cuts)"}});
    else
        setCaptions(m_state, {{paperNote, u"השוליים יישארו לבנים (בערך, המעבדה חותכת)",
                               u"White: stays empty (about, the lab cuts)"}});
}

void kyoskNew::setCoarseTexts() {
    const QString& paper = m_state.shemot.ppr;
    coarseNote.text =
        m_coarse.size() == 1
            ? m_state.wording(u"תמונה אחת תצא מפוקסלת בגודל %1", u"1 picture will look coarse at %1").arg(paper)
            : m_state.wording(u"%1 תמונות יצאו מפוקסלות בגודל %2", u"%1 pictures will look coarse at %2")
                  .arg(m_coarse.size())
                  .arg(paper);
}

} // namespace lumora
