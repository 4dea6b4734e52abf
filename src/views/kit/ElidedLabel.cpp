#include "views/kit/ElidedLabel.h"

#include "views/kit/Theme.h"

namespace lumora {

ElidedLabel::ElidedLabel(const char* type, QWidget* parent)
    : QLabel(parent) {
    setProperty("type", QString::fromLatin1(type));
    setTextFormat(Qt::PlainText);
    setSizePolicy(QSizePolicy::Ignored, QSizePolicy::Preferred);
}

void ElidedLabel::setWhole(const QString& text) {
    m_whole = text;
    setToolTip(text);
    setAccessibleName(text);
    elide();
}

void ElidedLabel::resizeEvent(QResizeEvent* event) {
    QLabel::resizeEvent(event);
    elide();
}

void ElidedLabel::elide() {
    setText(atLineStart(fontMetrics().elidedText(m_whole, Qt::ElideLeft, contentsRect().width()), !isRightToLeft()));
}

} // namespace lumora
