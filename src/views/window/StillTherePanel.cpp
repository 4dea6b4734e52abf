#include "views/window/StillTherePanel.h"

#include "session/SessionState.h"
#include "views/kit/Gauge.h"

namespace lumora {

using namespace Qt::StringLiterals;

StillTherePanel::StillTherePanel(const Theme& theme, QWidget* parent, const SessionState& state)
    : Overlay(theme, parent)
    , m_state(state)
    , m_gauge(new Gauge(theme, this)) {
    setObjectName(u"stillThere"_s);
    setLayoutDirection(state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    const QString title = state.wording(u"אתם עדיין כאן?", u"Are you still there?");
    setAccessibleName(title);
    m_gauge->setFixedSize(theme.px(170), theme.px(170));
    QPushButton* here = plainButton(u"stillHere"_s, "main", [this] { Q_EMIT answered(); });
    here->setText(state.wording(u"כן, אני כאן", u"Yes, I am here"));
    here->setAccessibleName(here->text());
    here->setMinimumHeight(theme.px(64));
    addRow({{inColumn(Space::Normal,
                      {Item::room(), words("title", title),
                       words("body", state.wording(u"אם לא, נחזור לדף הפתיחה, ודבר ממה שנבחר כאן לא יוצג עוד.",
                                                   u"If not, we go back to the first page, and nothing that was "
                                                   u"chosen here is shown any more.")),
                       Item::room()}),
             1},
            m_gauge},
           Space::Wide);
    column()->addWidget(here);
    setFirstFocus(here);
    whenEscaped([this] { Q_EMIT answered(); });
}

void StillTherePanel::tell(int secondsLeft, double share) {
    m_gauge->show(share, QString::number(secondsLeft), m_state.wording(u"שניות", u"seconds"));
}

} // namespace lumora
