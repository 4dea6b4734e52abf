#pragma once

#include "order/BasketLine.h"
#include "session/SessionState.h"

#include <QByteArray>
#include <QDateTime>
#include <QStringList>

#include <cstdint>
#include <optional>

namespace lumora {

class Files;
class OrderFolder;

// The order log: the customer, the order's options, the failed pictures and the whole basket. The lab's tools read it,
// and the senders when an order is sent again. docs/formats.md has its tables.
struct OrderLog {
    // Told apart by the first lines: one line "00" in a plain order, two in an album, "KeSherLaSharat = " in an edited
    // order.
    enum class Layout { Plain, Edited, Album };

    Layout layout = Layout::Plain;
    std::optional<QDateTime> Time;           // when the log was written
    QString Hazmana;                         // order name, without the "P" of the folder
    OrderKind Optint = OrderKind::NotChosen; // reading the log of an edited order gives EditedPrint
    std::int16_t DchisaAmoka = 0;            // 1: deep compression; not in the log of an edited order
    std::int16_t KeSherLaSharat = 0;
    QString HitKasherDerech;
    std::int16_t TaooyotBaHaShvaa = 0;
    OrderDetails shemot;
    AlbumDetails album;
    QStringList failed;                        // paths of the pictures that could not be prepared
    std::optional<std::int16_t> countOfFailed; // only read; not in the log of an edited order
    QStringList items;                         // basket lines

    static OrderLog of(const SessionState& state, Layout layout, const QStringList& items, const QStringList& failed,
                       const QDateTime& now);

    QByteArray write() const;

    // Reads a log of any layout; its keys may come in any order. A field whose key is missing stays as it is.
    void read(const QByteArray& bytes);

    BasketLine line(qsizetype index) const {
        return BasketLine::split(items[index], layout == Layout::Edited ? LineForm::Full : LineForm::Short);
    }
};

// The order's log; none where it can't be read or names no order.
std::optional<OrderLog> ReadOrderLog(const Files& files, const OrderFolder& folder);

} // namespace lumora
