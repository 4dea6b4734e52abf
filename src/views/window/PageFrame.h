#pragma once

#include "views/kit/Maker.h"
#include "views/window/StepBar.h"

#include <QWidget>

namespace lumora {

// What all pages share: the header with the step bar, the title, the content, and the bottom bar, where the main
// action stands at the far end of the reading direction and the way back at its beginning.
class PageFrame : public QWidget, private Maker {
    Q_OBJECT
public:
    PageFrame(const Theme& theme, QWidget* parent);

    StepBar& steps() const { return *m_steps; }
    void setTitle(const QString& title, const QString& subtitle = {});
    // The title takes no room, as on a page that needs all its height.
    void setTitleVisible(bool visible);

    // Of a panel: no header, no title, no bottom bar.
    void showContentOnly();

    QVBoxLayout* content() const { return m_content; }
    // Leaving, the language: at the far end of the header.
    void addHeaderActions(std::initializer_list<Item> items);
    void addMainActions(std::initializer_list<Item> items);
    void addSecondaryActions(std::initializer_list<Item> items);
    void addMainAction(QWidget* widget) { addMainActions({widget}); }
    void addSecondaryAction(QWidget* widget) { addSecondaryActions({widget}); }
    void addHeaderAction(QWidget* widget) { addHeaderActions({widget}); }
    // In the middle of the bottom bar: counts, totals.
    void addStatus(std::initializer_list<Item> items);
    void addStatus(QWidget* widget) { addStatus({Item(widget)}); }

private:
    StepBar* m_steps;
    QLabel* m_title;
    QLabel* m_subtitle;
    QWidget* m_titleBlock;
    QWidget* m_header;
    QWidget* m_bar;
    QHBoxLayout* m_headerActions;
    QVBoxLayout* m_content;
    QHBoxLayout* m_main;
    QHBoxLayout* m_secondary;
    QHBoxLayout* m_status;
};

} // namespace lumora
