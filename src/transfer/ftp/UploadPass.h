#pragma once

#include "transfer/delivery/SilenceLimit.h"
#include "transfer/delivery/UploadPace.h"
#include "transfer/ftp/FtpSession.h"

#include <QDateTime>
#include <QMap>
#include <QSet>

namespace lumora {

class UploadLines;

// One pass over List3; files that the server has are skipped. Each file has a session of its own, unless the lab keeps
// the session: then a fault alone begins another one, and the pass of a first attempt may go by several lines, once the
// first file is confirmed. The small picture that all orders share goes behind all others.
class UploadPass {
public:
    UploadPass(const SessionState& state, const Platform& platform, SendingEvents& events, SendingStop& stop,
               FtpLists& lists, FtpSession& session)
        : m_transfer(state.transfer)
        , m_platform(platform)
        , m_events(events)
        , m_stop(stop)
        , m_lists(lists)
        , m_session(session)
        , m_silence(state) {}

    // inHand: files whose put an earlier run has begun and neither confirmed nor reported as failed.
    void beginOrder(const QStringList& inHand);
    void run(int attempt);
    // An end of the sending that the last pass has reached by itself, and that another attempt would not mend.
    std::optional<SendingPhase> end() const { return m_end; }
    // True when each file of the order has been put well or skipped.
    bool triedAll() const;
    // Tells customer and lab that the server stores other line ends.
    void tellChanged();
    // Each second: ends a pass whose line is silent, and tells how far a kept session has come.
    void watch();

    // The two ends of a pass whose files the caller walks. endEarly: false where the pass has no end of its own.
    void beginFiles();
    bool endEarly();
    // index: of List3.
    void UploadOneFile(int index);
    // Ends a stopped pass: closes the session and tells the stop.
    void endStopped();

    std::int16_t UserStopped = 0;
    int CurrentIndex = -1;     // index in List3
    int BrokenBefore = 0;      // size of List4Broken before a put
    QDateTime LastPartTime;    // when the last piece was sent
    bool FaultPressed = false; // no page reads it

private:
    void endBy(SendingPhase end, LineStep step, const Failure& why);
    void endSilent();
    void endUnkept();
    Failure changed();
    void tellPiece(int index);
    void tellBytes();
    qint64 lengthOf(const QString& path) const { return m_lengths.value(path); }
    bool ends() const { return m_stop.StopFlag || m_stop.left; }
    bool mayGoByLines(int index) const;
    QSet<int> goByLines(int from);
    void handOut(UploadLines& lines, int index);
    void readAheadOf(int index) const;
    void begin(int index);
    void skip(const QString& path);
    bool settle(const QString& path, bool sent);
    bool reachOrderFolder();
    bool send(const QString& path);
    bool liesThere(const QString& path, const QString& name);
    void confirm(const QString& path);
    void countDone(const QString& path);
    bool put(int index);
    void closeWithPauses();

    const TransferState& m_transfer;
    const Platform& m_platform;
    SendingEvents& m_events;
    SendingStop& m_stop;
    FtpLists& m_lists;
    FtpSession& m_session;
    SilenceLimit m_silence;
    QStringList m_inHand;
    QSet<QString> m_done; // files of the order that were put well or skipped
    std::optional<SendingPhase> m_end;
    LineStep m_endStep = LineStep::Silence; // and why; not told where the page leads on by itself
    Failure m_endFailure;
    bool m_running = false;
    bool m_keeps = false;    // the session stays from file to file
    int m_putsOfSession = 0; // that were confirmed
    qint64 m_skipped = 0;    // bytes of the files that the server has, of this pass
    int m_lines = 1;         // by which the pass may still go

    // A kept session tells its way in bytes.
    QMap<QString, qint64> m_lengths; // of the order's files
    qint64 m_all = 0;
    qint64 m_before = 0; // of the files that earlier passes have brought there
    qint64 m_put = 0;    // of this pass, confirmed
    QSet<QString> m_putting;
    qint64 m_counted = 0; // what the line had moved when the files that are being put began
    UploadPace m_pace;
};

} // namespace lumora
