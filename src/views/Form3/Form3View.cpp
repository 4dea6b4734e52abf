#include "views/Form3/Form3View.h"

#include "views/kit/CardButtons.h"

namespace lumora {

using namespace Qt::StringLiterals;

Form3View::Form3View(Form3& page, const SessionState& state, const Theme& theme)
    : ViewOf(page, state, theme)
    , m_picture(new PictureBox(theme, this)) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    bind(u"Picture2"_s, m_picture, [this] { return c.Label1.text; });
    QLabel* unreadable = label(c.unreadable, "large");
    unreadable->setAlignment(Qt::AlignCenter);
    add(*frame().content(), {{m_picture, 1}, {unreadable, 1}});
    frame().addSecondaryActions({button(c.Command3, Role::Secondary, &Form3::Command3_Click, u"close"_s),
                                 button(c.Command2, Role::Quiet, &Form3::Command2_Click, u"resend"_s)});
    m_turn = button(c.Command1, Role::Main, &Form3::Command1_Click, u"rotate"_s);
    frame().addMainAction(m_turn);
    frame().addStatus(lineLabel(c.fileName, "muted"));
    start();
}

QWidget* Form3View::firstFocus() const {
    return m_turn;
}

void Form3View::render() {
    m_picture->setPicture(c.Picture2.image());
    m_picture->setVisible(!c.unreadable.visible);
    speak(m_picture, c.fileName.text);
}

} // namespace lumora
