#pragma once

#include "editing/caption/mikledet.h"
#include "views/window/PageView.h"

class QGridLayout;
class QStackedLayout;

namespace lumora {

class CaptionField;
class PaletteBar;

// A panel below the picture: what was typed, how it looks, the keys.
class mikledetView : public PageView {
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
    QPushButton* toKey(QPushButton* button);
    template <class Down, class Up>
    QPushButton* holdButton(const QString& name, const Caption& caption, const QString& icon, Down down, Up up);
    void sayAll();
    void showIcon(QPushButton* button, const QString& icon);

    mikledet& m_page;
    const mikledetControls& m_shows;
    CaptionField* m_text = nullptr;
    PaletteBar* m_palette = nullptr;
    QStackedLayout* m_row = nullptr; // the appearance or the symbols
    QPushButton* m_style = nullptr;
    QPushButton* m_direction = nullptr;
    QPushButton* m_more = nullptr;
    std::array<QPushButton*, KeyLayout::keys> m_keys{};
};

} // namespace lumora
