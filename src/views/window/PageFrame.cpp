#include "views/window/PageFrame.h"

#include "views/kit/Scroller.h"

namespace lumora {

using namespace Qt::StringLiterals;

PageFrame::PageFrame(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , Maker(theme, this) {
    auto* header = new QFrame(this);
    setRole(header, "header");
    m_headerActions = inRow(Space::Tight);
    m_steps = new StepBar(theme, header);
    QLabel* name = oneLine("large");
    name->setText(u"Lumora"_s);
    auto* mark = new QLabel(header);
    mark->setPixmap(theme.icon(u"lumora"_s, theme.px(38), Theme::Colour::Primary));
    // An upright page has the steps and what is counted in lines of their own.
    QBoxLayout* headerRows =
        theme.isTall()
            ? static_cast<QBoxLayout*>(
                  inColumn(Space::Tight, {inRow(Space::Normal, {mark, name, Item::room(), m_headerActions}), m_steps}))
            : inRow(Space::Normal, {mark, name, {m_steps, 1}, m_headerActions});
    headerRows->setContentsMargins(theme.margin(), theme.size(Space::Small), theme.margin(), theme.size(Space::Small));
    header->setLayout(headerRows);
    m_header = header;

    m_title = words("title");
    m_subtitle = words("muted");
    m_titleBlock = new QWidget(this);
    auto* titleColumn = inColumn(Space::None, {m_title, m_subtitle});
    titleColumn->setContentsMargins(theme.margin(), theme.size(Space::Wide), theme.margin(), 0);
    m_titleBlock->setLayout(titleColumn);

    m_content = inColumn(Space::Normal);
    auto* body = new QWidget(this);
    m_content->setContentsMargins(theme.margin(), theme.gap(), theme.margin(), theme.gap());
    body->setLayout(m_content);
    QWidget* shown = body;
    if (theme.scrolls())
        shown = inScroller(body, this);

    m_secondary = inRow(Space::Normal);
    m_status = inRow(Space::Normal);
    m_main = inRow(Space::Normal);
    auto* bar = new QFrame(this);
    setRole(bar, "bar");
    QBoxLayout* barRows =
        theme.isTall() ? static_cast<QBoxLayout*>(
                             inColumn(Space::Normal, {inRow(Space::None, {Item::room(), m_status, Item::room()}),
                                                      inRow(Space::Normal, {m_secondary, Item::room(), m_main})}))
                       : inRow(Space::Normal, {m_secondary, Item::room(), m_status, Item::room(), m_main});
    barRows->setContentsMargins(theme.margin(), theme.gap(), theme.margin(), theme.gap());
    bar->setLayout(barRows);
    bar->setMinimumHeight(theme.px(58) + 2 * theme.gap() + 2);
    m_bar = bar;

    setLayout(inColumn(Space::None, {m_header, m_titleBlock, {shown, 1}, m_bar}));
    layout()->setContentsMargins(0, 0, 0, 0);
}

void PageFrame::setTitle(const QString& title, const QString& subtitle) {
    m_title->setText(isolated(title));
    m_subtitle->setText(isolated(subtitle));
    m_subtitle->setVisible(!subtitle.isEmpty());
}

void PageFrame::setTitleVisible(bool visible) {
    m_titleBlock->setVisible(visible);
}

void PageFrame::showContentOnly() {
    m_header->hide();
    m_titleBlock->hide();
    m_bar->hide();
}

void PageFrame::addHeaderActions(std::initializer_list<Item> items) {
    add(*m_headerActions, items);
}

void PageFrame::addMainActions(std::initializer_list<Item> items) {
    add(*m_main, items);
}

void PageFrame::addSecondaryActions(std::initializer_list<Item> items) {
    add(*m_secondary, items);
}

void PageFrame::addStatus(std::initializer_list<Item> items) {
    add(*m_status, items);
}

} // namespace lumora
