#pragma once

namespace lumora {

// The three motions of the start page in pixels of a page 714 wide. A call is one step; the page's timers give the
// pace.
class StartMotion {
public:
    static constexpr int arrowTop = 400;
    static constexpr int arrowBottom = 430;
    static constexpr int panelWidth = 230;
    static constexpr int pictureWidth = 265;

    // Down by one, and from the bottom to the top again.
    void moveArrow();
    // The advertising picture narrows to 4 and widens to pictureWidth again. It stands until it has been at a limit.
    void movePicture();
    void foldPanel() { m_panel = 5; }
    // By 5; false once the panel is open.
    bool unfoldPanel();

    int Label8Top() const { return m_arrow; }
    int Picture4Width() const { return m_picture; }
    int Picture1Width() const { return m_panel; }

private:
    int m_arrow = arrowTop;
    int m_picture = pictureWidth;
    int m_pictureStep = 0;
    int m_panel = 0;
};

} // namespace lumora
