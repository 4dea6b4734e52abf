#pragma once

#include <QDateTime>
#include <QList>
#include <QString>

#include <cstdint>
#include <optional>
#include <variant>

namespace lumora {

struct AlbumDetails;
struct OrderDetails;

// A field of an order under its key in the order log; the order's hidden state keeps it under the same key.
struct OrderField {
    QString key;
    std::variant<QString*, std::int16_t*, std::optional<QDateTime>*> value;
};
using OrderFields = QList<OrderField>;

// In the order of the log.
OrderFields detailFields(OrderDetails& shemot);
// The keys count the extras from 1.
OrderFields albumFields(AlbumDetails& album);

// The last extra of each list, which the log leaves out.
OrderFields lastExtras(AlbumDetails& album);

} // namespace lumora
