#pragma once

#include "transfer/http/UploadForm.h"
#include "views/sending/SendingView.h"

class QPlainTextEdit;

namespace lumora {

class UploadFormView : public ViewOf<UploadForm, SendingView> {
    Q_OBJECT
public:
    UploadFormView(UploadForm& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override { return m_sendNow; }
    bool leave() override;

protected:
    void render() override;

private:
    QLayout* makeSide();
    void makeBars();
    void makeLabArea();
    QPlainTextEdit* answer(const Caption& caption);

    QPushButton* m_sendNow = nullptr;
    QLabel* m_telephone = nullptr;
    QProgressBar* m_count = nullptr;
    QProgressBar* m_pause = nullptr;
    QPlainTextEdit* m_answer = nullptr;
    QPlainTextEdit* m_listFile = nullptr;
    Overlay* m_labArea = nullptr;
};

} // namespace lumora
