#pragma once

#include "transfer/http/UploadForm.h"
#include "views/sending/SendingView.h"

namespace lumora {

class UploadFormView : public ViewOf<UploadForm, SendingView> {
    Q_OBJECT
public:
    UploadFormView(UploadForm& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override { return m_stop; }

private:
    QLayout* makeSide();
    void makeBars();

    QPushButton* m_stop = nullptr;
};

} // namespace lumora
