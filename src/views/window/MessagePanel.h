#pragma once

#include "views/kit/Overlay.h"

#include <QStringList>

class QPushButton;

namespace lumora {

// One box over the page: a sentence, and one or two clear buttons.
class MessagePanel : public Overlay {
    Q_OBJECT
public:
    enum class Kind { Message, Question };

    // The first button is the main one. The second button of a question means no.
    MessagePanel(const Theme& theme, QWidget* parent, Kind kind, const QString& title, const QString& text,
                 const QStringList& buttons);

Q_SIGNALS:
    void answered(bool yes);
};

} // namespace lumora
