#pragma once

#include "finished/orders/MoogMeret.h"
#include "views/window/PageView.h"

namespace lumora {

class Gauge;
class ScrolledPicture;

class MoogMeretView : public ViewOf<MoogMeret> {
    Q_OBJECT
public:
    MoogMeretView(MoogMeret& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;
    bool leave() override;

protected:
    void render() override;

private:
    QWidget* makeOrders();
    QWidget* makeHint();
    QWidget* makeWaiting();
    QWidget* makeFiles();
    QWidget* makeWalk();
    QWidget* makeWays();
    void makeBars();
    void renderOrders();
    void renderFiles();
    void renderWalk();
    void renderAnswer();

    QListWidget* m_orders = nullptr;
    QListWidget* m_waiting = nullptr;
    QListWidget* m_fileList = nullptr;
    QLabel* m_counts = nullptr;
    ScrolledPicture* m_preview = nullptr;
    Gauge* m_gauge = nullptr;
    Gauge* m_end = nullptr;
    QLabel* m_parts = nullptr;
    QPushButton* m_minutes = nullptr;
    QFrame* m_answer = nullptr;
    QLabel* m_answerSign = nullptr;
    QListWidget* m_packages = nullptr;
};

} // namespace lumora
