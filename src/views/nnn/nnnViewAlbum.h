#pragma once

#include "views/nnn/nnnView.h"

class QCheckBox;
class QStackedLayout;

namespace lumora {

enum class AlbumDrawing;
class ChoiceCards;
class DrawingCard;
class EditableCombo;

// The panels of a parent album within the view of the details page.
class nnnView::Album : private Maker {
public:
    explicit Album(nnnView& view);

    // Holds all panels and shows one.
    QWidget* widget() const { return m_widget; }
    // The buttons that lead to the next panel, one for each panel.
    QList<QPushButton*> makeMainButtons();
    QWidget* firstFocus() const;
    void render();

private:
    QWidget* makePhotographer();
    QWidget* makeKinds();
    QWidget* makeParents();
    QWidget* makeExtras();
    QWidget* makeBill();
    ChoiceCards* cards(const ComboCaption& choice, int columns, const QList<AlbumDrawing>& drawings, QSize size,
                       void (AlbumPanels::*taken)(int));
    QCheckBox* checkBox(const CheckCaption& caption, void (AlbumPanels::*clicked)(bool));
    template <class... Values>
    auto toAlbum(void (AlbumPanels::*handler)(Values...)) const {
        return [&album = m_album, handler](Values... values) { (album.*handler)(values...); };
    }

    nnnView& m_view;
    AlbumPanels& m_album;
    const AlbumControls& m_shown;
    const Theme& m_theme;
    QWidget* m_widget;
    QStackedLayout* m_panels;
    std::array<QLineEdit*, 4> m_boxes{};
    EditableCombo* m_domain = nullptr;
    std::array<DrawingCard*, 6> m_kinds{};
    QWidget* m_parents = nullptr;
    QWidget* m_copies = nullptr;
    QComboBox* m_parentSize = nullptr;
    QPushButton* m_less = nullptr;
    QPushButton* m_more = nullptr;
    std::array<ChoiceCards*, 4> m_choices{};
    QLabel* m_bill = nullptr;
    QLabel* m_billExtras = nullptr;
    QLabel* m_billParents = nullptr;
    AlbumPanels::Panel m_shownPanel = AlbumPanels::Panel::Photographer;
};

} // namespace lumora
