#pragma once

#include <QString>

namespace lumora {

class Dialogs;
struct SessionState;

// The telephone in the tail of a print file, which has ten characters. As built in, a longer number loses its last
// digits there. Log, sheet and report have what was typed.
class TailTelephone {
public:
    explicit TailTelephone(const SessionState& state)
        : m_state(state) {}

    static constexpr int width = 10;

    // The number for the tail, not yet cut to its width.
    QString of(const QString& typed) const;
    // Asks the customer where the tail would still cut the number. False: the customer wants to correct it.
    bool mayGoOnWith(const QString& typed, Dialogs& dialogs) const;

    // A number of more than ten characters gets 0 in place of "+972" and loses hyphens and blanks; a shorter one stays
    // as it is.
    static QString squeezed(const QString& typed);

private:
    QString question(const QString& kept) const;

    const SessionState& m_state;
};

} // namespace lumora
