#pragma once

#include <QByteArray>
#include <QDateTime>
#include <QStringList>

namespace lumora {

struct SessionState;

// The order log: who ordered, the order's options, which pictures failed and the whole basket, for the lab's tools and
// for a sender that takes the order up again. The first lines tell its forms apart: one line of "00" opens a print
// order, two an album, "KeSherLaSharat = " an edited order. docs/formats.md has the tables. items are the lines of the
// basket, failed the paths that could not be prepared.
QByteArray plainOrderLog(const SessionState& state, const QStringList& items, const QStringList& failed,
                         const QDateTime& now);
QByteArray editedOrderLog(const SessionState& state, const QStringList& items, const QStringList& failed,
                          const QDateTime& now);

} // namespace lumora
