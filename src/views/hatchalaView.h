#pragma once

#include "session/hatchala.h"
#include "views/PageView.h"

class QFrame;

namespace lumora {

class PictureBox;

class hatchalaView : public PageView {
    Q_OBJECT
public:
    hatchalaView(hatchala& page, const SessionState& state, const Theme& theme, const Files& files);
    QWidget* firstFocus() const override;

protected:
    void render() override;
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    hatchala& m_page;
    const Files& m_files;
    QPushButton* m_start;
    QPushButton* m_english;
    QLabel* m_headline;
    QLabel* m_how;
    std::vector<QLabel*> m_steps;
    QLabel* m_ask;
    QFrame* m_noticeBox;
    QWidget* m_telephone;
    QWidget* m_mail;
    Overlay* m_shops;
    QWidget* m_shopList;
    PictureBox* m_advert;
    QString m_advertFile;
    std::vector<std::pair<QWidget*, hatchala::Hover>> m_hovers;
};

} // namespace lumora
