#pragma once

#include "assembly/edited/B3.h"
#include "views/preparation/PreparationView.h"

namespace lumora {

class B3View : public ViewOf<B3, PreparationView> {
    Q_OBJECT
public:
    B3View(B3& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override { return m_start; }
    bool leave() override;

protected:
    void render() override;

private:
    PictureBox* m_picture;
    QFrame* m_pictureCard;
    QListWidget* m_list;
    QFrame* m_listCard;
    QPushButton* m_start;
};

} // namespace lumora
