#pragma once

#include "transfer/delivery/LineTrouble.h"

#include <QString>

#include <optional>

namespace lumora {

// What happens during a sending and needs at most a number to tell.
enum class SendingMoment {
    AttemptBegins, // number: the attempt, from 1
    RoundBegins,   // number: the round of the older bulk path, from 1
    RoundFailed,   // number: the round
    CheckBegins,
    CheckEnds,
    PassBegins,
    PassEnds,
    Incomplete, // number: files missing
    NothingToSend,
    Stopped, // the sending has stopped, as the customer asked

    // On the way to the lab's folder.
    SessionOpen,
    SessionClosed,
    Opening,      // number: the try
    NoInternet,   // number: tries plus one
    Connecting,   // number: the try
    NotConnected, // number: tries
    Connected,
    FolderFound,
    InsideServer,
    FolderMissing,
    WalkStep,  // one of the four steps to the lab's folder is done
    NoSession, // a folder is entered without a session; told once a pass
    NoDirectory,
    CutOff,
    OutsideFolder,
    Continuing, // the order's folder exists on the server
    Ready,

    // For each file.
    Reaching,  // its session begins
    Unreached, // the lab's folder was not found; the file is not sent
    WalkDone,
    Skipped,  // the server has the file
    FileDone, // number: position of the file, from 1
    Posted,   // number: files left

    // About the files on the server.
    Listed,  // number: files, "." and ".." included
    Counted, // number: files
    CheckingBroken,
    Missing,  // number: files missing
    Answered, // the server's answers have changed
};

// What the rules of a sending tell while they work. The rules know no page; the page that listens decides what is shown
// and in which words.
class SendingEvents {
public:
    virtual void reached(SendingMoment moment, int number = 0) = 0;
    // The pass has reached the file at index.
    virtual void progressed(int index, int count) = 0;
    // The file at index is being sent.
    virtual void sending(int index, int count, const QString& name) = 0;
    // share: part of the order's pieces that is sent, 0 to 1. minutes: minutes left, if the pace is known.
    virtual void pieceSent(double share, std::optional<int> minutes) = 0;
    // So many bytes of the order's files are there, of so many, as far as the line can tell. minutes: minutes left, if
    // the pace is known.
    virtual void movedBytes(qint64 there, qint64 all, std::optional<int> minutes) = 0;
    // subject: the file's name, if the step is about a file.
    virtual void failed(LineStep step, const Failure& failure, const QString& subject = {}) = 0;
    // A step of the sending could not be written into the order's folder.
    virtual void notKept(const Failure& failure) = 0;
    // level: 1 or 2, the lab's folder level that was entered. asTold: the current directory as the server tells it;
    // withoutSlash: the same without its leading slash.
    virtual void enteredFolder(int level, const QString& asTold, const QString& withoutSlash) = 0;
    // round: of a pause, from 1.
    virtual void pausing(int round) = 0;

protected:
    ~SendingEvents() = default;
};

} // namespace lumora
