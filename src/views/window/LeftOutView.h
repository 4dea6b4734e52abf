#pragma once

#include "imaging/Bitmap.h"
#include "session/LeftOutBox.h"
#include "views/window/PageView.h"

namespace lumora {

// The base of the views of the pages that prepare or send an order: the box of the pictures that are not in it, and the
// card that repeats their number.
class LeftOutView : public PageView {
    Q_OBJECT
protected:
    // The small picture of a row for a cell of that many pixels; null where it can't be shown.
    using Small = std::function<Bitmap(int row, int cell)>;
    LeftOutView(Page& page, const SessionState& state, const Theme& theme, const LeftOutControls& leftOut,
                std::function<void()> goOn, std::function<void()> back, Small small);

    QFrame* makeLeftOutCard();

    void render() override;

private:
    void renderRows();
    void readNext();
    QPixmap cell(const QImage& small, const QString& word) const;

    const LeftOutControls& m_leftOut;
    const Small m_small;
    QListWidget* m_names;
    QPushButton* m_goOn;
    QPushButton* m_back;
    Overlay* m_box;
    QTimer m_reader;  // reads one small picture after another, so that the box is there at once
    int m_unread = 0; // the next row that it reads
};

} // namespace lumora
