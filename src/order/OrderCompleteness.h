#pragma once

#include <QString>
#include <QStringList>

#include <optional>

namespace lumora {

class Files;
class OrderFolder;
struct OrderLog;

// The prints of an order, counted in three places. A print that travels in pieces counts when its whole family is
// there.
struct OrderCompleteness {
    // What the log names: its lines with a usable name, less the pictures that failed. None where there is no log.
    std::optional<int> named;
    int present = 0; // in the folder
    int marked = 0;  // among what is to be sent

    enum class Verdict {
        None,    // no print would be sent
        Fewer,   // not all that the log names
        Whole,   // all of them
        Unknown, // without a log nobody knows how many there should be
    };
    Verdict verdict() const;

    static OrderCompleteness of(const OrderLog* log, const QStringList& present, const QStringList& marked);
    // Reads log and names of the folder. marked: leaf names of the files to be sent.
    static OrderCompleteness read(const Files& files, const OrderFolder& folder, const QStringList& marked);
};

// The prints among these leaf names, each once: print files, and families of their pieces that are whole, which are
// those with the numbers 1 to n without a gap and n at least the declared total less one. A source of an exact multiple
// of the segment declares one piece more than it has.
QStringList PrintsAmong(const QStringList& names);

} // namespace lumora
