#pragma once

#include "views/kit/StepBar.h"
#include "views/kit/Theme.h"

#include <QWidget>

class QBoxLayout;
class QHBoxLayout;
class QLabel;
class QPushButton;
class QVBoxLayout;

namespace lumora {

// What all pages share: the header with the step bar, the title, the content, and the bottom bar, where the main
// action stands at the far end of the reading direction and the way back at its beginning.
class PageFrame : public QWidget {
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
    void addHeaderAction(QWidget* widget);
    void addMainAction(QWidget* widget);
    void addSecondaryAction(QWidget* widget);
    // In the middle of the bottom bar: counts, totals.
    void addStatus(QWidget* widget);

private:
    const Theme& m_theme;
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

// Labels take their look from the theme by this.
QLabel* makeLabel(QWidget* parent, const char* type);
void setRole(QWidget* widget, const char* role);
// The same for a widget that may have been shown, which takes its new look at once.
void changeRole(QWidget* widget, const char* role);

} // namespace lumora
