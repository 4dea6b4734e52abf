#pragma once

#include "common/DrivePath.h"
#include "transfer/ftp/FtpFrm.h"
#include "views/sending/SendingView.h"

class QProgressBar;

namespace lumora {

class Files;
class PictureBox;

class FtpFrmView : public ViewOf<FtpFrm, SendingView> {
    Q_OBJECT
public:
    FtpFrmView(FtpFrm& page, const SessionState& state, const Theme& theme, const Files& files);
    QWidget* firstFocus() const override { return m_sendNow; }
    bool leave() override;

protected:
    void render() override;

private:
    void makeProgress();
    QLayout* makeSide();
    void makeBars();
    QWidget* blinkingSigns();

    // FtpFrmViewLabArea.cpp
    void makeLabArea();
    QLayout* makeSendingLists();
    QLayout* makeChain();
    QLayout* makeManual();
    QPushButton* toggle(const CheckCaption& caption, void (FtpFrm::*clicked)());

    const Files& m_files;
    QProgressBar* m_pieces = nullptr;
    QProgressBar* m_pause = nullptr;
    QWidget* m_chain = nullptr; // the list of its orders
    PictureBox* m_proof = nullptr;
    DrivePath m_proofFile;
    QPushButton* m_sendNow = nullptr;
    QPushButton* m_count = nullptr;
    Overlay* m_leave = nullptr;
    Overlay* m_labArea = nullptr;
};

} // namespace lumora
