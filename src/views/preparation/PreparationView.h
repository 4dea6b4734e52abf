#pragma once

#include "assembly/PreparationPage.h"
#include "views/window/LeftOutView.h"

namespace lumora {

class Gauge;
class PictureBox;

// What the views of the two preparation pages show alike: how far the work has come, what went wrong, the warning not
// to delete the pictures yet, the sheet, and the number of prints.
class PreparationView : public LeftOutView {
    Q_OBJECT
protected:
    // The warning has two lines.
    PreparationView(PreparationPage& page, const SessionState& state, const Theme& theme, const Caption& title,
                    const Caption& warning, const Caption& warningBelow);

    // The card of what went wrong, for pages that show it.
    const Card& trouble() const { return m_trouble; }
    // The column beside the progress: cards of a page's own around the sheet's.
    QVBoxLayout* side() const { return m_side; }
    QFrame* sheet() const { return m_sheetCard.frame; }
    PictureBox* pictureBox();

    void render() override;

private:
    PreparationPage& m_page;
    const Caption& m_title;
    Gauge* m_gauge;
    Card m_trouble;
    Card m_sheetCard;
    PictureBox* m_sheet;
    QVBoxLayout* m_side;
    QLabel* m_total;
};

} // namespace lumora
