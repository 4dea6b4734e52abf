#include "views/window/LeftOutView.h"

#include "views/kit/Overlay.h"

#include <QListWidget>
#include <QPushButton>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// A file's name runs from left to right, the reason behind it as the language does.
QString nameAndReason(const QString& row) {
    const qsizetype at = row.lastIndexOf(u" – "_s);
    return at < 0 ? fromLeft(row) : fromLeft(row.left(at)) + row.mid(at);
}

} // namespace

LeftOutView::LeftOutView(Page& page, const SessionState& state, const Theme& theme, const LeftOutControls& leftOut,
                         std::function<void()> goOn, std::function<void()> back)
    : PageView(page, state, theme)
    , m_leftOut(leftOut)
    , m_names(listing(leftOut.List4Hasserot, nameAndReason))
    , m_goOn(button(leftOut.Command4Bli, Role::Main, std::move(goOn)))
    , m_back(button(leftOut.Command4Hazor, Role::Secondary, std::move(back)))
    , m_box(new Overlay(theme, this)) {
    m_names->setProperty("dense", true);
    m_names->setProperty("names", true);
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
    speak(m_names, m_leftOut.Label4Hasserot.text);
    m_box->setFirstFocus(m_leftOut.Command4Bli.visible ? m_goOn : m_back);
    m_box->setOpen(m_leftOut.Pic4Hasserot.visible);
}

} // namespace lumora
