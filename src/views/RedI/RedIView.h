#pragma once

#include "editing/redeye/RedI.h"
#include "views/window/HoldingView.h"

#include <utility>
#include <vector>

class QSlider;

namespace lumora {

class RedEyeCanvas;
class RedEyeOverview;
class RedEyeSteps;

class RedIView : public HoldingView<RedI> {
    Q_OBJECT
public:
    RedIView(RedI& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;
    void escape() override;

protected:
    void render() override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    QWidget* makeSide();
    QWidget* makePad();
    QLayout* makeTools();
    QWidget* makeOperator();
    void makeBars();
    void makeOverPicture();
    void makeMenu();
    void makeHelp();
    // A button that shows its sign alone; the words are its hint and its spoken meaning.
    QPushButton* bindSign(QPushButton* button, const char* icon, const Caption& caption);
    // A label of instructions; the blanks at the ends of its lines are not shown.
    QLabel* instruction(const Caption& caption);
    void placeOverPicture();
    void renderInstructions();

    RedEyeSteps* m_steps;
    RedEyeCanvas* m_canvas;
    RedEyeOverview* m_overview = nullptr;
    QPushButton* m_darken = nullptr;
    QPushButton* m_darkenBeside = nullptr;
    QPushButton* m_closer = nullptr;
    QPushButton* m_further = nullptr;
    QPushButton* m_more = nullptr;
    std::vector<std::pair<QPushButton*, const Caption*>> m_signs;
    std::vector<std::pair<QLabel*, const Caption*>> m_instructions;
    QLabel* m_guide = nullptr;
    QFrame* m_busy = nullptr;
    QFrame* m_notice = nullptr;
    QWidget* m_operator = nullptr;
    QLabel* m_readout = nullptr;
    QLabel* m_check = nullptr;
    QSlider* m_level = nullptr;
    QLabel* m_helpText = nullptr;
    Overlay* m_menu = nullptr;
    Overlay* m_help = nullptr;
};

} // namespace lumora
