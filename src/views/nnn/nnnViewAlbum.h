#pragma once

#include "views/nnn/nnnView.h"

class QCheckBox;
class QStackedLayout;

namespace lumora {

class AlbumCard;
class ChoiceCards;
class EditableCombo;

// The panels of a parent album within the view of the details page.
class nnnView::Album {
public:
    explicit Album(nnnView& view);

    // All panels, one of them seen.
    QWidget* widget() const { return m_widget; }
    // The buttons that lead on, one a panel.
    QList<QPushButton*> mainButtons() const { return m_mainButtons; }
    QWidget* firstFocus() const;
    void render();

private:
    QWidget* makePhotographer();
    QWidget* makeKinds();
    QWidget* makeParents();
    // highest: of a 1024 by 768 window.
    QWidget* makeChoice(ChoiceCards* cards, int share, int highest);
    QWidget* makeExtras();
    QWidget* makeBill();
    ChoiceCards* cards(const QString& name, const AlbumPanels::Choice& choice, int columns,
                       std::initializer_list<int> drawings, QSize size, void (AlbumPanels::*taken)(int));
    void addNext(const QString& name, const Caption& caption, void (AlbumPanels::*pressed)());

    nnnView& m_view;
    AlbumPanels& m_album;
    const Theme& m_theme;
    QWidget* m_widget;
    QStackedLayout* m_panels;
    std::array<QLineEdit*, 4> m_boxes{};
    EditableCombo* m_domain = nullptr;
    std::array<AlbumCard*, 6> m_kinds{};
    QWidget* m_parents = nullptr;
    QWidget* m_copies = nullptr;
    QComboBox* m_parentSize = nullptr;
    QPushButton* m_less = nullptr;
    QPushButton* m_more = nullptr;
    std::array<ChoiceCards*, 4> m_choices{};
    QLabel* m_bill = nullptr;
    QLabel* m_billExtras = nullptr;
    QLabel* m_billParents = nullptr;
    QList<QPushButton*> m_mainButtons;
    AlbumPanels::Panel m_shown = AlbumPanels::Panel::Photographer;
};

} // namespace lumora
