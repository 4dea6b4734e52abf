#pragma once

#include <QString>
#include <QStringList>

#include <algorithm>
#include <optional>

namespace lumora {

class Files;
class OrderFolder;
struct OrderLog;
struct SessionState;

inline const QString printPatterns = QStringLiteral("*.jpp;*.prk");

// The prints of an order, counted in three places. A print in pieces counts when all its pieces are there.
struct OrderCompleteness {
    // Prints that the log names: its lines with a usable name, less the pictures that failed. Without a log no value,
    // or where prints are damaged those of the folder.
    std::optional<int> named;
    int present = 0;          // whole in the folder
    int marked = 0;           // whole among what is to be sent
    int damaged = 0;          // in the folder, and not whole
    QStringList damagedFiles; // their files, by DamagedPrints
    int sent() const { return std::min(present, marked); }

    enum class Verdict {
        None,    // no print would be sent
        Fewer,   // not all that the log names
        Whole,   // all of them
        Unknown, // there is no log, so the number of prints is not known
    };
    Verdict verdict() const;

    // All are leaf names.
    static OrderCompleteness of(const OrderLog* log, const QStringList& present, const QStringList& marked,
                                const QStringList& damagedFiles = {});
    // Reads log, names and lengths of the folder. marked: leaf names of the files to be sent.
    static OrderCompleteness read(const SessionState& state, const Files& files, const OrderFolder& folder,
                                  const QStringList& marked);
};

// Of the prints and pieces of the folder those that are empty, or of another length than they were prepared with, where
// the order's state tells that. As built in nobody looks for them, and there are none.
QStringList DamagedPrints(const SessionState& state, const Files& files, const OrderFolder& folder);

// The prints among these leaf names, each once: print files, and complete families of pieces, numbered 1 to n without a
// gap, with n at least the declared total less one. A file of an exact multiple of the segment declares one piece more
// than it has.
QStringList PrintsAmong(const QStringList& names);

} // namespace lumora
