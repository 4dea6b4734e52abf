#pragma once

#include "selection/pictures/kyoskNew.h"
#include "views/kit/Swipe.h"
#include "views/window/PageView.h"

class QStackedLayout;

namespace lumora {

class CardOffer;
class EditableCombo;
class Gauge;
class LargePicture;
class PictureBox;
class PictureCell;
class ResolutionBadge;

class kyoskNewView : public ViewOf<kyoskNew> {
    Q_OBJECT
public:
    kyoskNewView(kyoskNew& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;
    bool leave() override;
    void escape() override;

protected:
    void render() override;
    void keyPressEvent(QKeyEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QLayout* makeTopRow();
    QWidget* makeGrid();
    void swipe(Swipe::Way way);
    PictureCell* makeCell(int i);
    QWidget* makeEmpty();
    QWidget* makeSide();
    void makeBars();
    void makeQuestions();
    void makeClosingPanel();
    void makeCopiesPanel();
    void makeBranchPanel();
    void pointAtBranch(const QObject* widget);
    void renderFolder();
    void renderCard();
    void renderCells();
    void renderClosing();
    void fitCells();
    void takeFocus();

    QStackedLayout* m_body = nullptr;
    std::array<PictureCell*, cellsOfPage> m_cells{};
    LargePicture* m_large = nullptr;
    QWidget* m_about = nullptr; // the large picture's words, where they may have to go
    ResolutionBadge* m_largeResolution = nullptr;
    QWidget* m_side = nullptr;
    std::array<QPushButton*, 3> m_offerButtons{};
    QLabel* m_folder = nullptr;
    QPushButton* m_firstFolder = nullptr;
    CardOffer* m_card = nullptr;
    std::array<QBoxLayout*, 2> m_cardPlaces{}; // of the first step, beside the cells
    QPushButton* m_previous = nullptr;
    QPushButton* m_next = nullptr;
    Overlay* m_leave = nullptr;
    Overlay* m_help = nullptr;
    Overlay* m_closing = nullptr;
    QLineEdit* m_mail = nullptr;
    QLabel* m_at = nullptr;
    QLabel* m_addressWord = nullptr;
    EditableCombo* m_domain = nullptr;
    QLineEdit* m_albumMail = nullptr;
    QLineEdit* m_note = nullptr;
    QPushButton* m_withoutAddress = nullptr;
    QPushButton* m_backToPictures = nullptr;
    Overlay* m_copies = nullptr;
    PictureBox* m_copiesPicture = nullptr;
    QPushButton* m_copiesBack = nullptr;
    Overlay* m_branches = nullptr;
    std::array<QPushButton*, 11> m_branchButtons{};
    Overlay* m_compression = nullptr;
    Overlay* m_door = nullptr;
    Gauge* m_doorGauge = nullptr;
    int m_focusRequest = 0;
};

} // namespace lumora
