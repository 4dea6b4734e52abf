// The wording of the box of left out pictures, in both languages.
#include "session/LeftOutBox.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QString reasonText(const SessionState& state, LeftOut::Why why) {
    switch (why) {
    case LeftOut::Why::NoJpeg:
        return state.wording(u"סיומת הקובץ אינה jpg או JPG", u"its ending is not jpg or JPG");
    case LeftOut::Why::Name:
        return state.wording(u"בשם הקובץ יש אות שאינה נתמכת", u"its file name has a letter that can't be used");
    case LeftOut::Why::Gone:
        return state.wording(u"הקובץ לא נמצא", u"the file was not found");
    case LeftOut::Why::Damaged:
        return state.wording(u"לא ניתן לקרוא את הקובץ", u"the file can't be read");
    case LeftOut::Why::NotWritten:
        return state.wording(u"לא ניתן היה לשמור אותה במחשב זה", u"it could not be stored on this computer");
    case LeftOut::Why::NotTold:
        return state.wording(u"לא ניתן היה להכין אותה להדפסה", u"it could not be prepared for printing");
    }
    return {};
}

} // namespace

QString LeftOutText(const SessionState& state, qsizetype count) {
    if (count == 0)
        return {};
    if (count == 1)
        return state.wording(u"תמונה אחת שבחרתם אינה בהזמנה.", u"1 picture that you chose is not in the order.");
    return state.wording(u"%1 תמונות שבחרתם אינן בהזמנה.", u"%1 pictures that you chose are not in the order.")
        .arg(count);
}

void LeftOutBox::show() {
    const bool one = m_state.transfer.leftOut.size() == 1;
    const bool withoutPrints = m_order == Order::WithoutPrints;
    m_shown.Label4Kartis.text = LeftOutText(m_state, m_state.transfer.leftOut.size());
    m_shown.Label4Kartis.visible = !m_shown.Label4Kartis.text.isEmpty();
    m_shown.Label4Hasserot.text = withoutPrints
                                      ? m_state.wording(u"אין בהזמנה אף תמונה שניתן להדפיס, ולכן היא לא תישלח.",
                                                        u"No picture of the order can be printed, so it is not sent.")
                                      : m_shown.Label4Kartis.text;
    m_shown.noPicture = m_state.wording(u"אין תמונה", u"No picture");
    m_shown.List4Hasserot.clear();
    m_shown.List4Siba.clear();
    for (const LeftOut& picture : m_state.transfer.leftOut) {
        m_shown.List4Hasserot.append(picture.picture.leaf());
        m_shown.List4Siba.append(reasonText(m_state, picture.why));
    }
    m_shown.Command4Bli.text = one ? m_state.wording(u"להמשיך בלעדיה", u"Go on without it")
                                   : m_state.wording(u"להמשיך בלעדיהן", u"Go on without them");
    m_shown.Command4Bli.visible = !withoutPrints;
    m_shown.Command4Hazor.text = leadsToPictures() ? m_state.wording(u"חזרה לתמונות", u"Back to the pictures")
                                                   : m_state.wording(u"חזרה לדף הפתיחה", u"To the start page");
    m_shown.Command4Hazor.visible = m_wayBack && (leadsToPictures() || withoutPrints);
}

} // namespace lumora
