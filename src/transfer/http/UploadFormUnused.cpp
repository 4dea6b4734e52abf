// Events of the page that no control sends: the lab's tests of its scripts.
#include "transfer/http/UploadForm.h"

namespace lumora {

void UploadForm::Command1_Click() {
    if (!idle())
        return;
    m_sender.postTestPicture();
    showAnswers();
    Q_EMIT changed();
}

void UploadForm::Command5_Click() {
    if (!idle())
        return;
    m_sender.postNothing();
    showAnswers();
    Q_EMIT changed();
}

void UploadForm::Command6_Click() {
    if (!idle())
        return;
    m_sender.fetchTestListing();
    showAnswers();
    Q_EMIT changed();
}

void UploadForm::Command7_Click() {
    if (!idle())
        return;
    m_busy = true;
    m_sender.lists.TxtWeb = QString::number(static_cast<int>(m_sender.CheckOrderOnServer(0)));
    m_busy = false;
    showAnswers();
    Q_EMIT changed();
}

void UploadForm::Command8_Click() {
    if (!idle())
        return;
    m_busy = true;
    m_sender.HttpFetchFileListN(0);
    m_busy = false;
    m_sender.readListInOrder();
    showAnswers();
    Q_EMIT changed();
}

} // namespace lumora
