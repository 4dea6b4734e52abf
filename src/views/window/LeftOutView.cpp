#include "views/window/LeftOutView.h"

#include "views/kit/Overlay.h"
#include "views/kit/Painting.h"
#include "views/kit/ScreenReader.h"

#include <QListWidget>
#include <QPushButton>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int cellSide = 64;

} // namespace

LeftOutView::LeftOutView(Page& page, const SessionState& state, const Theme& theme, const LeftOutControls& leftOut,
                         std::function<void()> goOn, std::function<void()> back, Small small)
    : PageView(page, state, theme)
    , m_leftOut(leftOut)
    , m_small(std::move(small))
    , m_names(listing(leftOut.List4Hasserot))
    , m_goOn(button(leftOut.Command4Bli, Role::Main, std::move(goOn)))
    , m_back(button(leftOut.Command4Hazor, Role::Secondary, std::move(back)))
    , m_box(new Overlay(theme, this)) {
    setAlert(*m_box);
    bindList(u"List4Siba"_s, leftOut.List4Siba);
    m_names->setProperty("dense", true);
    m_names->setIconSize({theme.px(cellSide), theme.px(cellSide)});
    connect(&m_reader, &QTimer::timeout, this, &LeftOutView::readNext);
    m_box->addRow({{sign(u"warning"_s, IconSize::Box), 0, Qt::AlignTop}, {label(leftOut.Label4Hasserot, "large"), 1}},
                  Space::Wide);
    m_box->column()->addWidget(m_names);
    m_box->addButtons(m_back, m_goOn);
    m_box->setWidth(Overlay::Width::Wide);
}

QFrame* LeftOutView::makeLeftOutCard() {
    const Card card = makeSignedCard("notice", u"warning"_s, Theme::Colour::Ink);
    add(*card.column, {label(m_leftOut.Label4Kartis, "strong")});
    follow(card.frame, m_leftOut.Label4Kartis);
    return card.frame;
}

void LeftOutView::render() {
    renderRows();
    speak(m_names, m_leftOut.Label4Hasserot.text);
    m_box->setFirstFocus(m_leftOut.Command4Bli.visible ? m_goOn : m_back);
    m_box->setOpen(m_leftOut.Pic4Hasserot.visible);
}

// A file's name runs from left to right, the reason below it as the language does.
void LeftOutView::renderRows() {
    if (!m_leftOut.Pic4Hasserot.visible)
        return;
    for (int i = m_names->count() - 1; i >= 0; --i) {
        QListWidgetItem& row = *m_names->item(i);
        row.setText(fromLeft(m_leftOut.List4Hasserot.item(i)) + u'\n' + m_leftOut.List4Siba.item(i));
        if (row.icon().isNull()) {
            row.setIcon(cell({}, {}));
            m_unread = i;
        }
    }
    if (m_unread < m_names->count())
        m_reader.start(0);
}

void LeftOutView::readNext() {
    QListWidgetItem* row = m_names->item(m_unread);
    if (!row || isDetached() || !m_leftOut.Pic4Hasserot.visible) {
        m_reader.stop();
        return;
    }
    const int pixels = static_cast<int>(theme().px(cellSide) * devicePixelRatioF());
    row->setIcon(cell(m_small(m_unread, pixels).image(), m_leftOut.noPicture));
    ++m_unread;
}

QPixmap LeftOutView::cell(const QImage& small, const QString& word) const {
    const int side = theme().px(cellSide);
    QPixmap made(QSize(side, side) * devicePixelRatioF());
    made.setDevicePixelRatio(devicePixelRatioF());
    made.fill(Theme::Colour::Sunken);
    QPainter painter(&made);
    const QRect room(0, 0, side, side);
    if (!small.isNull()) {
        painter.drawImage(fitted(room, small.size()), small);
    } else {
        painter.setFont(theme().font(Theme::Type::Small));
        painter.setPen(Theme::Colour::Muted);
        painter.drawText(room, Qt::AlignCenter | Qt::TextWordWrap, word);
    }
    return made;
}

} // namespace lumora
