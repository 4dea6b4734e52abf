#pragma once

#include "common/ListOutput.h"
#include "common/Result.h"
#include "session/SessionState.h"

#include <QByteArray>
#include <QMap>
#include <QStringList>

#include <optional>

namespace lumora {

class Files;
class OrderFolder;

// A text that is kept before it is known in which language it will be read.
struct BothLanguages {
    QString hebrew;
    QString english;

    bool operator==(const BothLanguages&) const = default;
};

// How far an order has come, kept in the hidden file .order of its folder, so that it can be continued after the
// program has ended. The file is never sent. docs/formats.md has the table.
struct OrderState {
    enum class Phase {
        Preparing, // prints are being made; the basket and the choices are kept with it
        Prepared,  // complete on the disk, nothing is sent
        Sending,   // its folder on the server was entered; a part may lie there
        Arrived,   // on the server as the sender judges it: proven, or as built in by the count of names
        Reported,  // arrived, and the lab was told or needs no telling
    };
    // The way by which the order is sent. A local station keeps it; the servers do not know an order that went by mail.
    enum class Way { Ftp, Http, Station, Mail };
    // Report and done call. Begun is stored before the request is sent, so it leaves open whether the lab has got it.
    enum class Report { NotYet, Begun, Done };

    Phase phase = Phase::Preparing;
    QString number; // MisparHazmana
    QString serial; // Shemot.ser
    OrderKind kind = OrderKind::NotChosen;
    Way way = Way::Ftp;
    // The server of this sender was about to be asked for the folder (by HTTP: the log was about to be posted), and the
    // answer is not known.
    std::optional<Sender> folderAsked;
    // The folder on the server is known as this order's own: made by it, or recognised (docs/guards.md).
    bool folderMadeByUs = false;
    bool fewerAgreed = false;      // all files of its folder arrived; the customer agreed that the log names more
    bool sentBefore = false;       // first known by a resend; an older version has sent it
    bool provenByNameOnly = false; // the server told no lengths
    bool proven = false;           // on a kiosk with Careful: each file lies there in its length
    int filesSent = 0;             // of a whole sending: answered well or found there, before the file in hand
    int filesInAll = 0;            // 0: not counted
    QStringList filesInHand;       // full paths whose put has begun and was not confirmed
    Report report = Report::NotYet;
    // Of an order that is sent by itself: tries that ended without its arrival, and what the last one ended with.
    int tries = 0;
    BothLanguages why;
    bool givenUp = false; // the staff wants it sent by itself no more
    bool held = false;    // the customer has stopped the count before its sending
    bool lapsed = false;  // on a kiosk: its customer has gone, and it is offered to nobody
    QString replaces;     // folder name of the order that this one was prepared again from
    QStringList items;    // lines of the basket; kept until the sending begins
    QString keptIn;       // the folder of KeptPictures; empty without one; kept as long as the lines
    QStringList marks;    // PictureMark of each line's picture; none in a state of an older version
    // Of the prints and pieces, by leaf name, in bytes: as they were prepared. None in a state of an older version.
    QMap<QString, qint64> lengths;
    QList<ListOutputEntry> choices; // as OrderChoices has them; kept until the lab was told
    QList<ListOutputEntry> further; // keys that this version does not know, kept as they are

    // Whole, or with the fewer pictures that the customer has agreed to.
    bool hasArrived() const { return phase >= Phase::Arrived || fewerAgreed; }
    // No telling of the lab was begun yet.
    bool onlyReportIsLeft() const { return hasArrived() && phase < Phase::Reported && report == Report::NotYet; }

    bool operator==(const OrderState&) const = default;

    QByteArray write() const;
    // Damaged: not whole, or with a word that this version does not know.
    static Result<OrderState> parse(const QByteArray& bytes);
};

// Whole and synced: a crash leaves the old state or the new one.
Result<void> WriteOrderState(const Files& files, const OrderFolder& folder, const OrderState& state);
// NotFound for an order without a state, which was made by an older version or by hand.
Result<OrderState> ReadOrderState(const Files& files, const OrderFolder& folder);

} // namespace lumora
