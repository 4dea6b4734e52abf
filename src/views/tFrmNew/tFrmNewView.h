#pragma once

#include "editing/editor/tFrmNew.h"
#include "selection/FolderPager.h"
#include "views/kit/HoldButton.h"
#include "views/window/PageView.h"

#include <QPointer>

#include <array>

class QFrame;
class QGridLayout;
class QHBoxLayout;

namespace lumora {

class EditorTable;
class FrameThumbs;
class kyoskNew;
class PageChain;
class StripCell;
class ToolButton;

// The editor: the picture in the middle, the tools around it by what they are for, and below it the small pictures of
// the page that the customer came from, so that the next one is a tap away.
class tFrmNewView : public PageView {
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

    QWidget* makePlaceAndLight();
    QWidget* makeFramesAndMore();
    QWidget* makeStrip();
    void makeTonePanel();
    void makeTurnPanel();
    void makeOperatorPanel();
    void makeHints();
    void makeBars();
    void bindTheRest();

    QVBoxLayout* toolColumn(QWidget& box) const;
    QFrame* group(QVBoxLayout& column, QLabel*& title);
    ToolButton* tool(const QString& name, const Caption& caption, const QString& icon, QSizeF size,
                     std::function<void()> clicked);
    ToolButton* held(const QString& name, const Caption& caption, const QString& icon, QSizeF size,
                     std::function<void()> down, std::function<void()> up);
    ToolButton* zoomOrLight(int index, const QString& icon, QSizeF size);
    ToolButton* colour(int index, const QString& icon, QColor ink);
    void addPlain(QHBoxLayout& row, const QString& name, const Caption& caption, Click click);

    void renderTitles();
    void renderStrip();
    void renderFrames();
    void renderHints();
    void placePanels();
    void listenToPictures();

    tFrmNew& m_page;
    const tFrmNewControls& m_shows;
    PageChain& m_chain;
    QPointer<kyoskNew> m_pictures;
    EditorTable* m_table = nullptr;
    QWidget* m_nearTools = nullptr;
    QWidget* m_farTools = nullptr;
    QWidget* m_strip = nullptr;
    QWidget* m_behindPanel = nullptr; // as high as what a panel covers
    std::array<StripCell*, cellsOfPage> m_cells{};
    ToolButton* m_zoomIn = nullptr;
    ToolButton* m_turn = nullptr;
    ToolButton* m_fineTurn = nullptr;
    ToolButton* m_tones = nullptr;
    QLabel* m_placeTitle = nullptr;
    QLabel* m_turnTitle = nullptr;
    QLabel* m_lightTitle = nullptr;
    QLabel* m_framesTitle = nullptr;
    QLabel* m_zoom = nullptr;
    QLabel* m_position = nullptr;
    QLabel* m_angle = nullptr;
    QLabel* m_name = nullptr;
    FrameThumbs* m_frames = nullptr;
    QFrame* m_tonePanel = nullptr;
    QFrame* m_turnPanel = nullptr;
    QFrame* m_operatorPanel = nullptr;
    QWidget* m_palette = nullptr;
    std::vector<std::pair<QLabel*, const Caption*>> m_hintLines;
    Overlay* m_hints = nullptr;
    QPushButton* m_hintsClose = nullptr;
    QPushButton* m_operator = nullptr;
    QPushButton* m_undo = nullptr;
    QPushButton* m_done = nullptr;
    int m_covered = 0;
};

} // namespace lumora
