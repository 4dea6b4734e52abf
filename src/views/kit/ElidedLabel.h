#pragma once

#include <QLabel>

namespace lumora {

// One line that takes the room that is left and cuts what does not fit at its beginning, as the last folders of a path
// tell most. The whole text is its tool tip and its accessible name.
class ElidedLabel : public QLabel {
    Q_OBJECT
public:
    ElidedLabel(const char* type, QWidget* parent);

    void setWhole(const QString& text);

protected:
    void resizeEvent(QResizeEvent* event) override;

private:
    void elide();

    QString m_whole;
};

} // namespace lumora
