#pragma once

#include "transfer/http/UploadForm.h"
#include "views/sending/SendingView.h"

namespace lumora {

class UploadFormView : public SendingView {
    Q_OBJECT
public:
    UploadFormView(UploadForm& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;

protected:
    void render() override;

private:
    QWidget* makeProgress();
    QWidget* makeSide();
    void makeBars();

    UploadForm& m_page;
    const UploadFormControls& m_shown;
    QFrame* m_trouble = nullptr; // a file that goes again
    QLabel* m_troubleLine = nullptr;
    QLabel* m_troubleReason = nullptr;
    QFrame* m_order = nullptr;
    QLabel* m_orderName = nullptr;
    QFrame* m_end = nullptr;
    QLabel* m_endName = nullptr;
    QLabel* m_endPhone = nullptr;
    QPushButton* m_stop = nullptr;
};

} // namespace lumora
