#pragma once

#include "finished/pieces/SpltForm.h"
#include "views/window/PageView.h"

class QProgressBar;

namespace lumora {

class SpltFormView : public ViewOf<SpltForm> {
    Q_OBJECT
public:
    SpltFormView(SpltForm& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;

protected:
    void render() override;

private:
    QWidget* makeCut();
    QWidget* makeJoin();
    QWidget* makeResult();
    void makeBars();
    // A list with its title over it. clicked null: only to look at.
    QVBoxLayout* makeList(const TextList& rows, const Caption& caption, void (SpltForm::*clicked)(int) = nullptr);
    QPushButton* workButton(const Caption& caption, void (SpltForm::*clicked)());
    void renderFamilies();
    void renderResult();

    QPushButton* m_cutFolder = nullptr;
    QListWidget* m_families = nullptr;
    QStringList m_familyWords; // as they stand in the rows
    QFrame* m_result = nullptr;
    QLabel* m_resultSign = nullptr;
    QProgressBar* m_progress = nullptr;
    std::vector<std::pair<const Caption*, QListWidget*>> m_titles;
};

} // namespace lumora
