#pragma once

#include "editing/ResolutionCaption.h"
#include "views/kit/CardButtons.h"

class QPushButton;

namespace lumora {

// One of the twelve small pictures, as large as its cell takes it, with the name over its lower edge. A press chooses
// it; a chosen one has a mark, and minus, the number of copies and plus in the place of the name. The keys + and -
// count too, and the arrows go to the neighbours.
class PictureCell : public CardButton {
    Q_OBJECT
public:
    PictureCell(const Theme& theme, QWidget* parent);

    struct Look {
        QImage picture;
        bool filled = false; // there is a picture, readable or not
        bool waiting = false;
        QString unreadable; // the word of a cell that can't be chosen
        bool chosen = false;
        bool inEditor = false;
        QString copies;
        QString name;
        ResolutionCaption resolution;
    };
    void show(const Look& look);

    QPushButton* plus() const { return m_plus; }
    QPushButton* minus() const { return m_minus; }
    QPushButton* copies() const { return m_copies; }
    // A press of the number is one of its own, and not of the picture.
    void setCopiesTyped(bool typed);
    QWidget* mark() const { return m_strip; }
    // The longer side of the room for the picture, in pixels of the screen.
    int pictureSide() const;

Q_SIGNALS:
    void arrow(int columns, int rows);
    void resized();

protected:
    void paintEvent(QPaintEvent* event) override;
    void paintInside(QPainter&, const QRectF&) override {}
    void keyPressEvent(QKeyEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;

private:
    QRect pictureRoom() const;
    int nameHeight() const;
    void fitPicture();

    Look m_look;
    QImage m_fitted;                       // in pixels of the screen
    std::pair<qint64, QSize> m_fittedFrom; // the picture's key and the room
    QWidget* m_strip;
    QPushButton* m_minus;
    QPushButton* m_copies;
    QPushButton* m_plus;
};

} // namespace lumora
