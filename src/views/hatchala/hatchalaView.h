#pragma once

#include "common/DrivePath.h"
#include "start/hatchala.h"
#include "views/window/PageView.h"

class QFrame;

namespace lumora {

class AdvertisingPicture;
class ArrowStrip;
class Prints;

class hatchalaView : public ViewOf<hatchala> {
    Q_OBJECT
public:
    hatchalaView(hatchala& page, const SessionState& state, const Theme& theme, const Files& files);
    QWidget* firstFocus() const override;
    bool leave() override;

protected:
    void render() override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;

private:
    void makeHeader();
    QLayout* makeWords();
    QLayout* makeSide();
    QWidget* makeStage();
    QWidget* makeHelp(hatchala::Hover over, const QString& icon);
    QWidget* makeContact();
    void makeStart();
    void makeShops();
    QWidget* makeDigits();
    void makeOffer();
    void helpFor(QWidget* widget, hatchala::Hover over);
    void renderMotion();
    void renderAdvert();
    void renderHelp();

    const Files& m_files;
    QPushButton* m_start = nullptr;
    QLabel* m_headline = nullptr;
    QFrame* m_noticeBox = nullptr;
    QWidget* m_telephone = nullptr;
    QWidget* m_mail = nullptr;
    Prints* m_prints = nullptr;
    ArrowStrip* m_arrow = nullptr;
    AdvertisingPicture* m_advert = nullptr;
    DrivePath m_advertFile;
    // What the two English hints say, each with the sign of its button beside it.
    struct Hint {
        const Caption* caption;
        QWidget* box;
        QLabel* text;
    };
    std::vector<Hint> m_hints;
    Hint makeHint(const Caption& caption, const QString& icon);
    struct Help {
        hatchala::Hover over;
        QLabel* text;
    };
    std::vector<Help> m_helps;
    Overlay* m_shops = nullptr;
    Overlay* m_offer = nullptr;
    QPushButton* m_takeBack = nullptr;
    QWidget* m_shopList = nullptr;
    std::vector<std::pair<QWidget*, hatchala::Hover>> m_hovers;
};

} // namespace lumora
