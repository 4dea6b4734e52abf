#pragma once

#include "order/BasketLine.h"
#include "session/SessionState.h"

#include <QByteArray>
#include <QDateTime>
#include <QStringList>

#include <cstdint>
#include <optional>

namespace lumora {

// The order log: who ordered, the order's options, which pictures failed and the whole basket, for the lab's tools and
// for a sender that takes the order up again. docs/formats.md has the tables.
struct OrderLog {
    // The first lines tell the layouts apart: one line of "00" opens a print order, two an album, "KeSherLaSharat = "
    // an edited order.
    enum class Layout { Plain, Edited, Album };

    Layout layout = Layout::Plain;
    std::optional<QDateTime> Time;           // when it was written
    QString Hazmana;                         // name of the order, never with the "P" of its folder
    OrderKind Optint = OrderKind::NotChosen; // that of an edited order is read as 2
    std::int16_t DchisaAmoka = 0;            // 1: deep compression; an edited order does not say
    std::int16_t KeSherLaSharat = 0;
    QString HitKasherDerech;
    std::int16_t TaooyotBaHaShvaa = 0;
    OrderDetails shemot;
    AlbumDetails album;
    QStringList failed;                        // paths of the pictures that could not be prepared
    std::optional<std::int16_t> countOfFailed; // read only: as the log says; an edited order's does not
    QStringList items;                         // lines of the basket

    static OrderLog of(const SessionState& state, Layout layout, const QStringList& items, const QStringList& failed,
                       const QDateTime& now);

    QByteArray write() const;

    // Takes the keys of all layouts in any order. A field whose key the bytes lack stays as it is.
    void read(const QByteArray& bytes);

    BasketLine line(qsizetype index) const {
        return BasketLine::split(items[index], layout == Layout::Edited ? LineForm::Full : LineForm::Short);
    }
};

} // namespace lumora
