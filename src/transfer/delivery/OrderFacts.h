#pragma once

#include <QList>
#include <QString>

namespace lumora {

struct SessionState;

// What a customer reads of an order before and after it is sent: a name of each fact, and the fact in words. Codes and
// marks that only the lab reads are none of it, and what is not known is left out.
struct OrderFact {
    QString name;
    QString text;
    bool operator==(const OrderFact&) const = default;
};
QList<OrderFact> OrderFacts(const SessionState& state);
// No order has more, with the day of the sending.
inline constexpr int mostFacts = 8;

// By which the customer is spoken to; empty where no name is known. A photographer is called by the whole name, which
// may be a studio's.
QString CalledName(const SessionState& state);

// Where the customer is reached; empty where no telephone is known.
QString GivenTelephone(const SessionState& state);

// The number that a customer can remember, of an order's name.
QString ShortNumber(const QString& orderName);

} // namespace lumora
