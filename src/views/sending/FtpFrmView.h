#pragma once

#include "transfer/ftp/FtpFrm.h"
#include "views/sending/SendingView.h"

class QProgressBar;

namespace lumora {

class PictureBox;

class FtpFrmView : public SendingView {
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
    void showProof();

    FtpFrm& m_page;
    const FtpFrmControls& m_shown;
    const Files& m_files;
    QProgressBar* m_pieces = nullptr;
    QWidget* m_minutes = nullptr;
    QFrame* m_summary = nullptr;
    QLabel* m_summaryLines = nullptr;
    QFrame* m_order = nullptr;
    QLabel* m_orderName = nullptr;
    QFrame* m_delivery = nullptr;
    PictureBox* m_proof = nullptr;
    QString m_proofFile;
    QPushButton* m_sendNow = nullptr;
    QPushButton* m_count = nullptr;
    Overlay* m_leave = nullptr;
    Overlay* m_labArea = nullptr;
};

} // namespace lumora
