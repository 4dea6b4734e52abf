#pragma once

#include "editing/editor/Form3.h"
#include "views/window/PageView.h"

namespace lumora {

class PictureBox;

class Form3View : public PageView {
    Q_OBJECT
public:
    Form3View(Form3& page, const SessionState& state, const Theme& theme);
    void escape() override { m_page.Command3_Click(); }
    QWidget* firstFocus() const override;

protected:
    void render() override;

private:
    Form3& m_page;
    const Form3Controls& m_shows;
    PictureBox* m_picture;
    QLabel* m_unreadable;
    QPushButton* m_turn;
};

} // namespace lumora
