// Shows the events of a sending by HTTP in the page's controls and words.
#include "order/OrderFolder.h"
#include "session/SessionState.h"
#include "transfer/http/UploadForm.h"

namespace lumora {

using namespace Qt::StringLiterals;

void UploadForm::reached(SendingMoment moment, int number) {
    switch (moment) {
    case SendingMoment::AttemptBegins:
        Label1.text = number == 1 ? QString()
                                  : wording(u"שולח קבצים שלא עלו כראוי", u"Sending files that did not go up properly");
        Picture6.visible = false;
        Label10.text = m_state.profile.LabPhone;
        Label4Tel.text = wording(u"טלפון החנות: %1", u"The shop's telephone: %1").arg(Label10.text.trimmed());
        Label4Tel.visible = !Label10.text.trimmed().isEmpty();
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
        showLeft(number);
        break;
    case SendingMoment::Answered:
        Label15.text = OrderFolder::chosen(m_state).name();
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
    if (count > 0) {
        const double share = index * 100.0 / count;
        Label7.text = QString::number(share).left(3);
        percent = static_cast<int>(share);
        PicSargel1Width = static_cast<int>(PicSargel2Width * share / 100);
    }
    caption = Label7.text + u" %   "_s +
              wording(u"נא לא לסגור עד גמר המשלוח", u"Please do not close until the end of the sending");
    Q_EMIT changed();
}

void UploadForm::failed(LineStep step, const Failure& failure, const QString& subject) {
    tellReason(step, failure, subject);
    showTrouble();
}

void UploadForm::pausing(int round) {
    Pic4Hamten.visible = true;
    Pic4HamtenWidth = round / 27;
    Q_EMIT changed();
}

} // namespace lumora
