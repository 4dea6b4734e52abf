#pragma once

#include "transfer/http/UploadForm.h"
#include "views/window/PageView.h"

class QFrame;

namespace lumora {

class Gauge;

class UploadFormView : public PageView {
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
    void bindTheRest();

    UploadForm& m_page;
    Gauge* m_gauge = nullptr;
    QLabel* m_countdown = nullptr;
    QFrame* m_trouble = nullptr; // a file that goes again
    QLabel* m_troubleLine = nullptr;
    QLabel* m_troubleReason = nullptr;
    QFrame* m_failure = nullptr;
    QFrame* m_order = nullptr;
    QLabel* m_orderHead = nullptr;
    QLabel* m_orderName = nullptr;
    QLabel* m_left = nullptr;
    QLabel* m_phone = nullptr;
    QFrame* m_end = nullptr;
    QLabel* m_endName = nullptr;
    QLabel* m_endPhone = nullptr;
    QPushButton* m_stop = nullptr;
    QPushButton* m_again = nullptr;
    QPushButton* m_goOn = nullptr;
    QPushButton* m_refresh = nullptr;
    QPushButton* m_newOrder = nullptr;
    QPushButton* m_close = nullptr; // in the end
    QWidget* m_main = nullptr;      // the main action that was in sight last
};

} // namespace lumora
