#pragma once

#include "transfer/delivery/LineTrouble.h"

#include <QString>

#include <optional>

namespace lumora {

// A moment of a sending that needs no more than a number to be told.
enum class SendingMoment {
    AttemptBegins, // number: the attempt, from 1
    RoundBegins,   // the same of the older bulk path
    RoundFailed,   // number: the round
    CheckBegins,
    CheckEnds,
    PassBegins,
    PassEnds,
    Incomplete, // number: files missing
    NothingToSend,
    Stopped, // the customer's stop has been followed

    // The way to the lab's folder.
    SessionOpen,
    SessionClosed,
    Opening,      // number: the try
    NoInternet,   // number: tries and one
    Connecting,   // number: the try
    NotConnected, // number: tries
    Connected,
    FolderFound,
    InsideServer,
    FolderMissing,
    WalkStep,  // one of the four steps of the walk is done
    NoSession, // a folder is to be entered without a session; told once a pass
    NoDirectory,
    CutOff,
    OutsideFolder,
    Continuing, // the order's folder is there already
    Ready,

    // A file.
    Reaching,  // its session begins
    Unreached, // the lab's folder was not found; the file is left out
    WalkDone,
    Skipped,  // the server has it already
    FileDone, // number: its place, from 1
    Posted,   // number: files left

    // What the server holds.
    Listed,  // number: files, before the dots are taken out
    Counted, // number: files
    CheckingBroken,
    Missing,  // number: files missing
    Answered, // the server's texts have changed
};

// What the rules of a sending tell while they work. They know no page: what is shown, and in which words, is decided by
// who hears it.
class SendingEvents {
public:
    virtual void reached(SendingMoment moment, int number = 0) = 0;
    // The pass has come to the file at index.
    virtual void progressed(int index, int count) = 0;
    // The file at index is put on the line.
    virtual void sending(int index, int count, const QString& name) = 0;
    // share: 0 to 1 of the pieces of the order; minutes: left, where the pace is known.
    virtual void pieceSent(double share, std::optional<int> minutes) = 0;
    // subject: the file's name where a file is concerned.
    virtual void failed(LineStep step, const Failure& failure, const QString& subject = {}) = 0;
    // The list of broken files could not be written.
    virtual void brokenNotKept(const Failure& failure) = 0;
    // The remote directory at the lab's first or second folder level, as the server tells it and without its slash.
    virtual void enteredFolder(int level, const QString& asTold, const QString& withoutSlash) = 0;
    // One round of a pause, counted from 1.
    virtual void pausing(int round) = 0;

protected:
    ~SendingEvents() = default;
};

} // namespace lumora
