#pragma once

#include "selection/pictures/kyoskNew.h"
#include "views/window/PageView.h"

class QFrame;
class QGridLayout;
class QStackedLayout;

namespace lumora {

class EditableCombo;
class LargePicture;
class PictureCell;

class kyoskNewView : public PageView {
    Q_OBJECT
public:
    kyoskNewView(kyoskNew& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;
    void escape() override;

protected:
    void render() override;
    void keyPressEvent(QKeyEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QLayout* makeTopRow();
    QWidget* makeGrid();
    QWidget* makeEmpty();
    QWidget* makeSide();
    void makeBars();
    void makeLeavePanel();
    void makeClosingPanel();
    void makeBranchPanel();
    void makeCompressionPanel();
    void makeHelpPanel();
    void bindTheRest();
    void renderCells();
    void renderClosing();
    void fitCells();
    void takeFocus();

    kyoskNew& m_page;
    QStackedLayout* m_body = nullptr;
    std::array<PictureCell*, cellsOfPage> m_cells{};
    LargePicture* m_large = nullptr;
    QWidget* m_side = nullptr;
    QFrame* m_offer = nullptr;
    QLabel* m_folder = nullptr;
    QLabel* m_emptyHead = nullptr;
    QLabel* m_emptyText = nullptr;
    QPushButton* m_turn = nullptr;
    QPushButton* m_firstFolder = nullptr;
    QPushButton* m_previous = nullptr;
    QPushButton* m_next = nullptr;
    QPushButton* m_finish = nullptr;
    QPushButton* m_finishAlbum = nullptr;
    QFrame* m_total = nullptr;
    QLabel* m_totalNumber = nullptr;
    QLabel* m_totalWord = nullptr;
    Overlay* m_leave = nullptr;
    Overlay* m_help = nullptr;
    QPushButton* m_helpClose = nullptr;
    Overlay* m_closing = nullptr;
    QLabel* m_closingHead = nullptr;
    QLineEdit* m_mail = nullptr;
    QLabel* m_at = nullptr;
    EditableCombo* m_domain = nullptr;
    QLineEdit* m_albumMail = nullptr;
    QLineEdit* m_note = nullptr;
    QPushButton* m_withAddress = nullptr;
    QPushButton* m_withoutAddress = nullptr;
    QPushButton* m_backToPictures = nullptr;
    Overlay* m_branches = nullptr;
    QLabel* m_branchHead = nullptr;
    std::array<QPushButton*, 11> m_branchButtons{};
    Overlay* m_compression = nullptr;
    int m_focusRequest = 0;
};

} // namespace lumora
