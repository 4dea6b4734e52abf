#pragma once

#include "editing/editor/tFrmNew.h"
#include "selection/FolderPager.h"
#include "views/tFrmNew/PaperPlace.h"
#include "views/window/HoldingView.h"

#include <QPointer>

#include <array>
#include <optional>

namespace lumora {

class EditorTable;
class FrameThumbs;
class kyoskNew;
class PageChain;
class ResolutionBadge;
class StripCell;
class ToolButton;

// The editor: the picture in the middle, the tools around it by what they are for, and below it the small pictures of
// the page that the customer came from, so that the next one is a tap away.
class tFrmNewView : public HoldingView<tFrmNew> {
    Q_OBJECT
public:
    tFrmNewView(tFrmNew& page, PageChain& chain, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;
    void setCoveredHeight(int pixels) override;
    void escape() override;

protected:
    void render() override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    using Click = void (tFrmNew::*)();

    QWidget* makeTools();
    QWidget* makePlace();
    QLayout* makeTurns();
    QLayout* makeLight();
    QWidget* makeFramesAndMore();
    QLayout* makeFrameSteps();
    QWidget* makeStrip();
    void makeTonePanel();
    void pressTones();
    void makeTurnPanel();
    void makeOperatorPanel();
    void makeHints();
    void makeBars();

    QFrame* group(const Caption& title, std::initializer_list<Item> items);
    ToolButton* tool(const Caption& caption, const QString& icon, QSizeF size, std::function<void()> clicked);
    ToolButton* tool(const Caption& caption, const QString& icon, QSizeF size, Click clicked) {
        return tool(caption, icon, size, toPage(clicked));
    }
    ToolButton* heldTool(const Caption& caption, const QString& icon, QSizeF size, std::function<void()> down,
                         std::function<void()> up);
    ToolButton* zoomOrLight(int index, const QString& icon, QSizeF size);
    ToolButton* colour(int index, const QString& icon, QColor ink);

    void renderStrip();
    void renderHints();
    std::optional<PanelForms> turnForms() const;
    void placePanels();
    void listenToPictures();

    PageChain& m_chain;
    QPointer<kyoskNew> m_pictures;
    EditorTable* m_table = nullptr;
    QWidget* m_nearTools = nullptr;
    QWidget* m_farTools = nullptr;
    QWidget* m_frameTools = nullptr; // among them
    QFrame* m_moreTools = nullptr;   // the first group of the far ones
    QWidget* m_strip = nullptr;
    QWidget* m_behindPanel = nullptr; // as high as what a panel covers
    std::array<StripCell*, cellsOfPage> m_cells{};
    ToolButton* m_zoomIn = nullptr;
    ToolButton* m_turn = nullptr;
    ToolButton* m_fineTurn = nullptr;
    ToolButton* m_tones = nullptr;
    QLabel* m_zoom = nullptr;
    QLabel* m_position = nullptr;
    QLabel* m_angle = nullptr;
    QLabel* m_name = nullptr;
    ResolutionBadge* m_resolution = nullptr;
    QComboBox* m_categories = nullptr;
    QComboBox* m_lineStyles = nullptr;
    FrameThumbs* m_frames = nullptr;
    QPushButton* m_previous = nullptr;
    QPushButton* m_next = nullptr;
    QFrame* m_tonePanel = nullptr;
    bool m_tonesPressed = false; // its panel was opened by a press, not by the pointer that passed
    QFrame* m_turnPanel = nullptr;
    QBoxLayout* m_turns = nullptr; // the buttons of the panel, in a row or in a column
    QFrame* m_operatorPanel = nullptr;
    QWidget* m_palette = nullptr;
    std::vector<std::pair<QLabel*, const Caption*>> m_hintLines;
    Overlay* m_hints = nullptr;
    QPushButton* m_operator = nullptr;
    QPushButton* m_help = nullptr;
    QPushButton* m_undo = nullptr;
    QPushButton* m_done = nullptr;
    int m_covered = 0;
};

} // namespace lumora
