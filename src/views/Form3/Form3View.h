#pragma once

#include "editing/editor/Form3.h"
#include "views/window/PageView.h"

namespace lumora {

class PictureBox;

class Form3View : public ViewOf<Form3> {
    Q_OBJECT
public:
    Form3View(Form3& page, const SessionState& state, const Theme& theme);
    void escape() override { m_page.Command3_Click(); }
    QWidget* firstFocus() const override;

protected:
    void render() override;

private:
    PictureBox* m_picture;
    QPushButton* m_turn = nullptr;
};

} // namespace lumora
