#include "views/Form3/Form3View.h"

#include "common/DrivePathText.h"
#include "views/kit/Cards.h"

#include <QLabel>
#include <QPushButton>
#include <QVBoxLayout>

namespace lumora {

using namespace Qt::StringLiterals;

Form3View::Form3View(Form3& page, const SessionState& state, const Theme& theme)
    : PageView(page, state, theme)
    , m_page(page)
    , m_shows(page.controls()) {
    frame().steps().setStep(OrderStep::Pictures);
    frame().setTitleVisible(false);
    m_picture = new PictureBox(theme, this);
    bind(u"Picture2"_s, m_picture, [this] { return m_shows.Label1.text; });
    frame().content()->addWidget(m_picture, 1);
    m_unreadable = makeLabel(this, "large");
    m_unreadable->setAlignment(Qt::AlignCenter);
    frame().content()->addWidget(m_unreadable, 1);
    bindHidden(u"Label1"_s, m_shows.Label1);

    frame().addSecondaryAction(button(
        u"Command3"_s, m_shows.Command3, Role::Secondary, [&page = m_page] { page.Command3_Click(); }, u"close"_s));
    frame().addSecondaryAction(button(
        u"Command2"_s, m_shows.Command2, Role::Quiet, [&page = m_page] { page.Command2_Click(); }, u"resend"_s));
    m_turn = button(
        u"Command1"_s, m_shows.Command1, Role::Main, [&page = m_page] { page.Command1_Click(); }, u"rotate"_s);
    frame().addMainAction(m_turn);
    auto* name = makeLabel(this, "muted");
    name->setWordWrap(false);
    bind(u"fileName"_s, name, [this] { return LeafName(m_shows.Label1.text); });
    frame().addStatus(name);
    start();
}

QWidget* Form3View::firstFocus() const {
    return m_turn;
}

void Form3View::render() {
    const bool shows = !m_shows.Picture2.isNull();
    m_picture->setPicture(m_shows.Picture2.image());
    m_picture->setVisible(shows);
    m_unreadable->setVisible(!shows);
    m_unreadable->setText(m_shows.unreadable);
    speak(m_picture, LeafName(m_shows.Label1.text));
}

} // namespace lumora
