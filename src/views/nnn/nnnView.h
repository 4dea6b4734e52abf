#pragma once

#include "entry/details/nnn.h"
#include "views/window/PageView.h"

#include <array>
#include <memory>

class QStackedLayout;

namespace lumora {

class BorderSample;
class Tile;

class nnnView : public ViewOf<nnn> {
    Q_OBJECT
public:
    nnnView(nnn& page, const SessionState& state, const Theme& theme);
    ~nnnView() override;
    QWidget* firstFocus() const override;
    bool leave() override;
    void escape() override;

protected:
    void render() override;

private:
    class Album;

    QWidget* makeMenu();
    QWidget* makeDetails();
    QWidget* makeOptions();
    QWidget* makeBorders();
    QWidget* makeFit();
    QWidget* makeTerms();
    void makeHeader();
    void makeBars();
    void placeTiles();

    std::unique_ptr<Album> m_album;
    QStackedLayout* m_steps;
    std::array<Tile*, 10> m_tiles{};
    std::array<QAbstractButton*, 3> m_sizes{};
    QGridLayout* m_tileGrid = nullptr;
    QList<int> m_placed;
    QLineEdit* m_name = nullptr;
    QLineEdit* m_telephone = nullptr;
    QLineEdit* m_address = nullptr;
    QPushButton* m_back = nullptr;
    QComboBox* m_moreSizes = nullptr;
    BorderSample* m_sample = nullptr;
    QFrame* m_hint = nullptr;
    QLabel* m_chosen = nullptr;
    Overlay* m_clean = nullptr;
    nnn::Step m_shownStep = nnn::Step::Menu;
    int m_focusRequest = 0;
};

} // namespace lumora
