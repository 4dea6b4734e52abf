#pragma once

#include "assembly/PreparationPage.h"
#include "views/window/PageView.h"

class QFrame;
class QVBoxLayout;

namespace lumora {

class Gauge;
class PictureBox;

// What the views of the two preparation pages show alike: how far the work has come, what went wrong, the warning not
// to delete the pictures yet, the sheet, and the number of prints.
class PreparationView : public PageView {
    Q_OBJECT
protected:
    struct NamedCaption {
        QString name;
        const Caption& caption;
    };
    PreparationView(PreparationPage& page, const SessionState& state, const Theme& theme, const NamedCaption& warning,
                    const NamedCaption& warningBelow);

    // The column beside the progress, for what the pages have of their own.
    QVBoxLayout* side() const { return m_side; }
    // The card of all that went wrong; shown where the page says so.
    QFrame* trouble() const { return m_trouble; }
    QVBoxLayout* troubleColumn() const { return m_troubleColumn; }
    // A card of the side column, with a line above what it holds.
    struct Card {
        QFrame* frame;
        QVBoxLayout* column;
    };
    Card addCard(int stretch);
    // The sheet's card, to be added where the page has it.
    void addSheet(int stretch);

    void renderProgress(const QString& title);

private:
    PreparationPage& m_page;
    Gauge* m_gauge;
    QFrame* m_trouble;
    QVBoxLayout* m_troubleColumn;
    QVBoxLayout* m_side;
    QFrame* m_sheetCard = nullptr;
    PictureBox* m_sheet = nullptr;
    QLabel* m_total;
};

} // namespace lumora
