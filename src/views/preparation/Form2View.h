#pragma once

#include "assembly/plain/Form2.h"
#include "views/preparation/PreparationView.h"

namespace lumora {

class Form2View : public ViewOf<Form2, PreparationView> {
    Q_OBJECT
public:
    Form2View(Form2& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override { return m_start; }
    bool leave() override;

protected:
    void render() override;

private:
    QListWidget* m_removed;
    QListWidget* m_list;
    QFrame* m_listCard;
    QPushButton* m_start;
};

} // namespace lumora
