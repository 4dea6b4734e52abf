// The lab's own area of the page that sends by HTTP: the tests of the lab's scripts. Names of commands stand as the
// lab's people know them.
#include "session/CaptionTexts.h"
#include "session/SessionState.h"
#include "transfer/delivery/StoppableLine.h"
#include "transfer/http/UploadForm.h"

namespace lumora {

using namespace Qt::StringLiterals;

void UploadForm::setLabTexts() {
    setCaptions(m_state, {{Command24, u"הצג יותר פרטים", u"Show more details"},
                          {Command9, u"הסתר פרטים", u"Hide details"},
                          {Label4Kvazim, u"קבצי ההזמנה", u"Files of the order"},
                          {Label4Hossarim, u"קבצים חסרים", u"Missing files"},
                          {Label4AfterWeb, u"ברשימת השרת", u"In the server's list"},
                          {Label4InOrder, u"בקובץ הרשימה", u"In the list file"},
                          {Label4Answer, u"תשובת השרת", u"The server's answer"},
                          {Label4ListFile, u"קובץ הרשימה", u"The list file"},
                          {Label4Query, u"המשך הכתובת:", u"Rest of the query:"},
                          {Command1, u"Upload File"},
                          {Command5, u"listfile.php"},
                          {Command6, u"GetUrlSource"},
                          {Command7, u"BdokBaSharat"},
                          {Command8, u"filelisthom.txt"}});
}

void UploadForm::showLabArea(bool shown) {
    Frame2.visible = shown && m_state.mayOpenOperatorArea();
    Q_EMIT changed();
}

void UploadForm::showLabButtons() {
    for (Caption* test : {&Command1, &Command5, &Command6, &Command7, &Command8})
        test->enabled = idle() && phase() != SendingPhase::Preparing;
    showReporting();
    Q_EMIT changed();
}

// A test stops the count; nothing is sent while it runs.
template <class Test>
void UploadForm::run(const Test& test) {
    if (!idle() || phase() == SendingPhase::Preparing)
        return;
    stopCount();
    m_busy = true;
    showLabButtons();
    {
        const StoppableLine line(m_platform);
        test();
    }
    m_busy = false;
    showAnswers();
    showLabButtons();
}

void UploadForm::postTestPicture() {
    run([this] { m_sender.postTestPicture(); });
}

void UploadForm::postNothing() {
    run([this] { m_sender.postNothing(); });
}

void UploadForm::fetchTestListing() {
    run([this] { m_sender.fetchTestListing(); });
}

// The check goes by names alone; what is to be sent stays as the sending found it.
void UploadForm::checkOrder() {
    run([this] {
        const TextList missing = lists().List4Hossarim;
        const std::optional<int> left = m_left;
        m_sender.lists.TxtWeb = QString::number(static_cast<int>(m_sender.CheckOrderOnServer(0)));
        m_sender.lists.List4Hossarim = missing;
        m_left = left;
        showLeft();
    });
}

void UploadForm::fetchListFile() {
    run([this] {
        m_sender.HttpFetchFileListN(0);
        m_sender.readListInOrder();
    });
}

} // namespace lumora
