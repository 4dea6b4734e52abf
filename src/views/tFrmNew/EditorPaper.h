#pragma once

#include "editing/editor/tFrmNew.h"
#include "views/kit/FingerMoves.h"
#include "views/kit/Theme.h"
#include "views/tFrmNew/PaperPlace.h"

#include <QEvent>
#include <QWidget>

#include <optional>

namespace lumora {

// The paper on the editor's table, as large as the table lets it be. It draws the page's preview as it is and hands on
// where the mouse or the finger is, in logical pixels of the paper.
class EditorPaper : public QWidget {
    Q_OBJECT
public:
    explicit EditorPaper(tFrmNew& page, QWidget* parent);

    void render();
    QWidget* captionBox() const { return m_caption; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    enum class Drag { None, Picture, Caption, CropHandle };
    QPointF onPaper(QPointF position) const { return position / m_scale; }
    void drag(QEvent::Type type, QPointF at);

    tFrmNew& m_page;
    const tFrmNewControls& m_shown;
    QWidget* m_caption; // the dashed box, which lies over the picture
    QImage m_preview;
    double m_scale = 1; // of the widget's pixels to the paper's
    Drag m_drag = Drag::None;
};

// What the paper lies on: dark and neutral, so that colours are seen as they are. Two fingers and the wheel zoom; the
// fingers turn as well where the panel of the turns is open.
class EditorTable : public QWidget, public PinchTarget {
    Q_OBJECT
public:
    EditorTable(tFrmNew& page, const Theme& theme, QWidget* parent);

    EditorPaper& paper() const { return *m_paper; }
    // words: what stands there while no picture is open.
    void render(const QString& words);
    // Fits the paper into so much of the table's height, beside the panel if there is one. Returns where the panel
    // lies.
    PaperPlace place(int height, const std::optional<PanelForms>& panel);
    void touched() override;
    void pinched(const Pinch& pinch) override;
    void pinchEnded() override { m_steps.reset(); }

Q_SIGNALS:
    void resized();

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;

private:
    tFrmNew& m_page;
    const Theme& m_theme;
    EditorPaper* m_paper;
    QString m_words;
    std::optional<PinchSteps> m_steps;
    bool m_turns = false; // the panel was open when the fingers came
    int m_wheel = 0;      // what is less than a notch, in eighths of a degree
};

} // namespace lumora
