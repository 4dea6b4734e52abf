#pragma once

#include "entry/notice/Havharot.h"
#include "views/window/PageView.h"

namespace lumora {

class HavharotView : public ViewOf<Havharot> {
    Q_OBJECT
public:
    HavharotView(Havharot& page, const SessionState& state, const Theme& theme);
    QWidget* firstFocus() const override;
    bool leave() override;
    void escape() override { m_page.Command1_Click(); }

protected:
    void render() override;

private:
    QPushButton* m_goOn;
};

} // namespace lumora
