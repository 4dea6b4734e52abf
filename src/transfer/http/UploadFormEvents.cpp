// Shows the events of a sending by HTTP in the page's controls and words.
#include "order/OrderFolder.h"
#include "session/SessionState.h"
#include "transfer/http/UploadForm.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

void UploadForm::reached(SendingMoment moment, int number) {
    switch (moment) {
    case SendingMoment::AttemptBegins:
        m_attemptFailed = number > 1;
        Label1.text = m_attemptFailed
                          ? wording(u"שולח קבצים שלא עלו כראוי", u"Sending files that did not go up properly")
                          : QString();
        Picture6.visible = false;
        Label10.text = m_state.profile.LabPhone;
        Label4Tel.text =
            wording(u"טלפון החנות: %1", u"The shop's telephone: %1").arg(m_state.profile.LabPhone.trimmed());
        Label4Tel.visible = !m_state.profile.LabPhone.trimmed().isEmpty();
        PicSargel1Width = 1;
        percent = 0;
        Label7.text = u"0"_s;
        Label9.visible = true;
        enter(SendingPhase::Sending);
        break;
    case SendingMoment::CheckBegins:
        Label4File.text.clear();
        enter(SendingPhase::Checking);
        break;
    case SendingMoment::CheckEnds:
        Label9.visible = Pic4Hamten.visible = false;
        break;
    case SendingMoment::Posted:
    case SendingMoment::Missing:
        m_left = number;
        showLeft();
        break;
    case SendingMoment::Answered:
        m_orderName = OrderFolder::chosen(m_state).name();
        showOrder();
        showAnswers();
        break;
    default:
        break;
    }
    Q_EMIT changed();
}

void UploadForm::sending(int index, int count, const QString& name) {
    Label4File.text = wording(u"קובץ %1 מתוך %2: %3", u"File %1 of %2: %3").arg(index + 1).arg(count).arg(name);
    Q_EMIT changed();
}

void UploadForm::progressed(int index, int count) {
    Label4.text = QString::number(index);
    const double share = index * 100.0 / std::max(count, 1);
    const QString number = QString::number(share).left(3);
    Label7.text = number;
    percent = static_cast<int>(share);
    PicSargel1Width = static_cast<int>(PicSargel2Width * share / 100);
    caption = number + u" %   "_s +
              wording(u"נא לא לסגור עד גמר המשלוח", u"Please do not close until the end of the sending");
    Q_EMIT changed();
}

void UploadForm::failed(LineStep step, const Failure& failure, const QString& subject) {
    tellReason(step, failure, subject);
    showTrouble();
}

void UploadForm::notKept(const Failure&) {
    tellNotKept();
}

void UploadForm::pausing(int round) {
    Pic4Hamten.visible = true;
    Pic4HamtenWidth = round / 27;
    Q_EMIT changed();
}

} // namespace lumora
