#pragma once

#include <QString>

namespace lumora {

struct SessionState;

// What an order has in the place of the address of a customer who gives none.
inline const QString mailNotTyped = QStringLiteral("לא הוקלד");

// A mail address as it is typed in two boxes.
struct TypedAddress {
    QString name;           // before the "@"
    QString domain;         // behind it
    bool untouched = false; // the box of the domain still shows its prompt

    // As it would be typed for this address.
    static TypedAddress of(const QString& address);
};

// Makes one mail address of the two boxes. As built in they are joined as they stand, the prompt too.
class MailAddressGuard {
public:
    explicit MailAddressGuard(const SessionState& state)
        : m_state(state) {}

    // A whole address in the first box is taken as it is. Empty where nothing was typed.
    QString address(const TypedAddress& typed) const;
    // What was typed is an address, by either box.
    static bool isComplete(const TypedAddress& typed);
    // The customer is asked for the domain.
    bool lacksDomain(const TypedAddress& typed) const;
    // The domain that was chosen stays when its boxes are opened again.
    bool keepsDomain(const TypedAddress& typed) const;

private:
    const SessionState& m_state;
};

} // namespace lumora
