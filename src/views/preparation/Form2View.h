#pragma once

#include "assembly/plain/Form2.h"
#include "views/preparation/PreparationView.h"

class QListWidget;

namespace lumora {

class Form2View : public PreparationView {
    Q_OBJECT
public:
    Form2View(Form2& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;

protected:
    void render() override;

private:
    Form2& m_page;
    QListWidget* m_removed;
    QListWidget* m_list;
    QFrame* m_listCard;
    QPushButton* m_start;
};

} // namespace lumora
