#pragma once

#include "assembly/Form2.h"
#include "views/PageView.h"

class QFrame;
class QListWidget;

namespace lumora {

class Gauge;
class PictureBox;

class Form2View : public PageView {
    Q_OBJECT
public:
    Form2View(Form2& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;

protected:
    void render() override;

private:
    Form2& m_page;
    Gauge* m_gauge;
    PictureBox* m_sheet;
    QFrame* m_sheetCard;
    QFrame* m_trouble;
    QListWidget* m_removed;
    QListWidget* m_list;
    QFrame* m_listCard;
    QPushButton* m_start;
    QLabel* m_total;
};

} // namespace lumora
