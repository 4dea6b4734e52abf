#include "views/kit/PageFrame.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QVBoxLayout>
#include <QVariant>

namespace lumora {

QLabel* makeLabel(QWidget* parent, const char* type) {
    auto* label = new QLabel(parent);
    label->setProperty("type", QString::fromLatin1(type));
    label->setTextFormat(Qt::PlainText);
    label->setWordWrap(true);
    return label;
}

void setRole(QWidget* widget, const char* role) {
    widget->setProperty("role", QString::fromLatin1(role));
}

void changeRole(QWidget* widget, const char* role) {
    if (widget->property("role").toString() == QLatin1StringView(role))
        return;
    setRole(widget, role);
    widget->setStyleSheet(widget->styleSheet());
}

PageFrame::PageFrame(const Theme& theme, QWidget* parent)
    : QWidget(parent)
    , m_theme(theme) {
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);

    auto* header = new QFrame(this);
    setRole(header, "header");
    auto* headerRow = new QHBoxLayout(header);
    headerRow->setContentsMargins(theme.margin(), theme.px(8), theme.margin(), theme.px(6));
    headerRow->setSpacing(theme.gap());
    auto* mark = new QLabel(header);
    mark->setPixmap(theme.icon(QStringLiteral("lumora"), theme.px(38), Theme::Colour::Primary));
    auto* name = makeLabel(header, "large");
    name->setText(QStringLiteral("Lumora"));
    name->setWordWrap(false);
    headerRow->addWidget(mark);
    headerRow->addWidget(name);
    m_steps = new StepBar(theme, header);
    headerRow->addWidget(m_steps, 1);
    m_headerActions = new QHBoxLayout;
    m_headerActions->setSpacing(theme.px(4));
    headerRow->addLayout(m_headerActions);
    m_header = header;
    column->addWidget(header);

    m_titleBlock = new QWidget(this);
    auto* titleColumn = new QVBoxLayout(m_titleBlock);
    titleColumn->setContentsMargins(theme.margin(), theme.px(18), theme.margin(), 0);
    titleColumn->setSpacing(theme.px(2));
    m_title = makeLabel(m_titleBlock, "title");
    m_subtitle = makeLabel(m_titleBlock, "muted");
    titleColumn->addWidget(m_title);
    titleColumn->addWidget(m_subtitle);
    column->addWidget(m_titleBlock);

    auto* body = new QWidget(this);
    m_content = new QVBoxLayout(body);
    m_content->setContentsMargins(theme.margin(), theme.px(14), theme.margin(), theme.px(14));
    m_content->setSpacing(theme.gap());
    column->addWidget(body, 1);

    auto* bar = new QFrame(this);
    setRole(bar, "bar");
    auto* barRow = new QHBoxLayout(bar);
    barRow->setContentsMargins(theme.margin(), theme.px(12), theme.margin(), theme.px(12));
    barRow->setSpacing(theme.gap());
    const auto section = [&] {
        auto* row = new QHBoxLayout;
        row->setSpacing(theme.gap());
        barRow->addLayout(row);
        return row;
    };
    m_secondary = section();
    barRow->addStretch(1);
    m_status = section();
    barRow->addStretch(1);
    m_main = section();
    bar->setMinimumHeight(theme.px(58) + theme.px(24) + 2);
    m_bar = bar;
    column->addWidget(bar);
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

void PageFrame::addHeaderAction(QWidget* widget) {
    m_headerActions->addWidget(widget);
}

void PageFrame::addMainAction(QWidget* widget) {
    m_main->addWidget(widget);
}

void PageFrame::addSecondaryAction(QWidget* widget) {
    m_secondary->addWidget(widget);
}

void PageFrame::addStatus(QWidget* widget) {
    m_status->addWidget(widget);
}

} // namespace lumora
