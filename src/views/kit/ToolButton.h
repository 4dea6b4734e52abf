#pragma once

#include "views/kit/HoldButton.h"
#include "views/kit/Theme.h"

#include <QImage>

namespace lumora {

// A tool of the editor: a sign with a short word below it. Where what it does can be shown, a small picture stands in
// the sign's place.
class ToolButton : public HoldButton {
    Q_OBJECT
public:
    // Handlers only where the tool works as long as it is held. Width and height of a 1024 by 768 window.
    ToolButton(const Theme& theme, QString icon, QSizeF size, QWidget* parent, Handlers handlers = {});

    void setInk(QColor colour);
    void setPicture(const QImage& picture);
    // marked: the tool's setting is the one in use.
    void setMarked(bool marked);

    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QString said() const;
    QFont words() const;
    QStringList lines() const;

    const Theme& m_theme;
    QString m_icon;
    QSizeF m_size;
    QColor m_ink = Theme::Colour::Ink;
    QImage m_picture;
    bool m_marked = false;
};

} // namespace lumora
