#pragma once

#include "editing/caption/mikledet.h"
#include "views/window/HoldingView.h"

class QStackedLayout;

namespace lumora {

class CaptionField;
class PaletteBar;

// A panel below the picture: what was typed, how it looks, the keys.
class mikledetView : public HoldingView<mikledet> {
    Q_OBJECT
public:
    mikledetView(mikledet& page, const SessionState& state, const Theme& theme);
    bool isPanel() const override { return true; }
    QWidget* firstFocus() const override;
    void escape() override;

protected:
    void render() override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    QLayout* makeTextRow();
    QWidget* makeAppearance();
    QWidget* makeSymbols();
    QWidget* makeKeys();
    QPushButton* key(int number);
    QPushButton* toRound(QPushButton* button, const Caption& caption);
    QPushButton* holdButton(const Caption& caption, const char* icon, std::function<void()> down,
                            std::function<void()> up);
    QPushButton* choice(const CheckCaption& caption, const QString& spoken, std::function<void()> clicked);
    void showIcon(QPushButton* button, const QString& icon);

    CaptionField* m_text = nullptr;
    PaletteBar* m_palette = nullptr;
    QStackedLayout* m_row = nullptr; // the appearance or the symbols
    QPushButton* m_style = nullptr;
    QPushButton* m_direction = nullptr;
    std::array<QPushButton*, KeyLayout::keys> m_keys{};
    std::vector<std::pair<QWidget*, const QString*>> m_spoken; // what shows no words of its own
};

} // namespace lumora
