#pragma once

#include <QObject>

namespace lumora {

// Hides the mouse pointer from the first touch until a mouse moves.
class TouchPointer : public QObject {
    Q_OBJECT
public:
    explicit TouchPointer(QObject* parent);
    ~TouchPointer() override;

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void setHidden(bool hidden);

    bool m_hidden = false;
};

} // namespace lumora
