#pragma once

#include "transfer/ftp/FtpFrm.h"
#include "views/window/PageView.h"

class QFrame;
class QProgressBar;

namespace lumora {

class Gauge;
class PictureBox;

class FtpFrmView : public PageView {
    Q_OBJECT
public:
    FtpFrmView(FtpFrm& page, const SessionState& state, const Theme& theme, const Files& files);
    QWidget* firstFocus() const override;

protected:
    void render() override;

private:
    QWidget* makeProgress();
    QWidget* makeSide();
    void makeBars();
    void makePanels();
    void bindTheRest();
    void moveFocus(bool sending, QWidget* mainAction);

    FtpFrm& m_page;
    bool m_wasSending = false;
    const Files& m_files;
    Gauge* m_gauge = nullptr;
    QProgressBar* m_pieces = nullptr;
    QWidget* m_minutes = nullptr;
    QLabel* m_minutesUnit = nullptr;
    QFrame* m_failure = nullptr;
    QLabel* m_failureLine = nullptr;
    QLabel* m_successLine = nullptr;
    QFrame* m_summary = nullptr;
    QLabel* m_summaryLines = nullptr;
    QFrame* m_order = nullptr;
    QLabel* m_orderHead = nullptr;
    QLabel* m_orderName = nullptr;
    QLabel* m_counts = nullptr;
    QFrame* m_delivery = nullptr;
    PictureBox* m_proof = nullptr;
    QString m_proofFile;
    QPushButton* m_sendNow = nullptr;
    QPushButton* m_sendAgain = nullptr;
    QPushButton* m_newOrder = nullptr;
    QPushButton* m_stop = nullptr;
    QPushButton* m_count = nullptr;
    QPushButton* m_exit = nullptr;
    QLabel* m_status = nullptr;
    Overlay* m_leave = nullptr;
    QLabel* m_leaveText = nullptr;
    Overlay* m_hiddenArea = nullptr;
    std::vector<std::pair<QLabel*, std::pair<QString, QString>>> m_listTitles;
};

} // namespace lumora
