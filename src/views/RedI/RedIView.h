#pragma once

#include "editing/redeye/RedI.h"
#include "views/window/PageView.h"

#include <utility>
#include <vector>

class QFrame;
class QSlider;

namespace lumora {

class HoldButton;
class RedEyeCanvas;
class RedEyeOverview;
class RedEyeSteps;

class RedIView : public PageView {
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
    QLayout* makePad();
    QLayout* makeTools();
    QWidget* makeOperator();
    // A button that shows its sign alone; the words are its hint and its spoken meaning.
    void bindSign(const QString& name, QPushButton* button, const QString& icon, const Caption& caption);
    // A label of instructions; the blanks at the ends of its lines are not shown.
    QLabel* words(const QString& name, const Caption& caption);
    HoldButton* hold(const QString& name, const Caption& caption, const char* role, const QString& icon,
                     std::function<void()> down, std::function<void()> up);
    void makeMenu();
    void makeHelp();
    void placeOverPicture();
    void bindTheRest();

    RedI& m_page;
    const RedIControls& m_shows;
    RedEyeSteps* m_steps;
    RedEyeCanvas* m_canvas;
    RedEyeOverview* m_overview = nullptr;
    QPushButton* m_correct = nullptr;
    QPushButton* m_accept = nullptr;
    QPushButton* m_darken = nullptr;
    QPushButton* m_darkenBeside = nullptr;
    QPushButton* m_closer = nullptr;
    QPushButton* m_further = nullptr;
    QPushButton* m_more = nullptr;
    std::vector<std::pair<QPushButton*, const Caption*>> m_signs;
    std::vector<std::pair<QLabel*, const Caption*>> m_words;
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
