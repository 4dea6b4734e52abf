#pragma once

namespace lumora {

// The three motions of the start page, in pixels of a page 714 wide. Each call is one step; the page's timers call
// them.
class StartMotion {
public:
    static constexpr int arrowTop = 400;
    static constexpr int arrowBottom = 430;
    static constexpr int panelWidth = 230;
    static constexpr int pictureWidth = 265;

    // Moves the arrow down by one pixel; from the bottom it returns to the top.
    void moveArrow();
    // Narrows the advertising picture to 4 pixels and widens it to pictureWidth again.
    void movePicture();
    void foldPanel() { m_panel = 5; }
    // Opens the panel by 5 pixels more; false once it is open.
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
