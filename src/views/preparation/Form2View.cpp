#include "views/preparation/Form2View.h"

#include "common/DrivePath.h"

#include <QListWidget>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

QString fileName(const QString& path) {
    return fromLeft(LeafName(path));
}

} // namespace

Form2View::Form2View(Form2& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme, page.controls().Label1, page.controls().Label6, page.controls().Label10) {
    m_removed = listing(c.List4removed, fileName);
    m_removed->setMaximumHeight(theme.size(Extent::Drawing));
    add(*trouble().column, {label(c.Label4removed, "strong"), m_removed});
    m_list = list(c.List1, &Form2::List1_Click, fileName);
    const Card lines = makeCard("card", Pad::Slim);
    m_listCard = lines.frame;
    add(*lines.column, {{m_list, 1}, button(c.Command1, Role::Plain, &Form2::Command1_Click, u"trash"_s)});
    add(*side(), {{sheet(), 3}, {m_listCard, 4}});

    frame().addHeaderAction(button(c.Command7, Role::Quiet, &Form2::Command7_Click, u"exit"_s));
    m_start = button(c.Command3, Role::Main, &Form2::Command3_Click);
    frame().addMainAction(m_start);
    start();
}

bool Form2View::leave() {
    m_page.Command7_Click();
    return true;
}

void Form2View::render() {
    PreparationView::render();
    trouble().frame->setVisible(m_page.isTroubleShown());
    speak(m_removed, c.Label4removed.text);
    speak(m_list, m_page.listText());
    m_removed->setVisible(!c.List4removed.isEmpty());
    m_listCard->setVisible(m_page.isListShown());
}

} // namespace lumora
