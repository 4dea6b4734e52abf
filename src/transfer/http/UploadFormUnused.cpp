// Events of the page that no control sends: the lab's tests of its scripts.
#include "transfer/http/UploadForm.h"

namespace lumora {

template <class Test>
void UploadForm::run(const Test& test) {
    if (!idle())
        return;
    test();
    showAnswers();
    Q_EMIT changed();
}

void UploadForm::Command1_Click() {
    run([this] { m_sender.postTestPicture(); });
}

void UploadForm::Command5_Click() {
    run([this] { m_sender.postNothing(); });
}

void UploadForm::Command6_Click() {
    run([this] { m_sender.fetchTestListing(); });
}

void UploadForm::Command7_Click() {
    run([this] {
        m_busy = true;
        m_sender.lists.TxtWeb = QString::number(static_cast<int>(m_sender.CheckOrderOnServer(0)));
        m_busy = false;
    });
}

void UploadForm::Command8_Click() {
    run([this] {
        m_busy = true;
        m_sender.HttpFetchFileListN(0);
        m_busy = false;
        m_sender.readListInOrder();
    });
}

} // namespace lumora
