#include "order/OrderLog.h"

#include "common/ListOutput.h"
#include "session/SessionState.h"

namespace lumora {
namespace {

const QString stars = QString(45, u'*');

QString orderName(const SessionState& state) {
    return state.shemot.TimeOfJob + state.MisparHazmana;
}

// Three values that nothing sets; their places in the file are part of the format.
void writeServerLines(ListOutput& log, const SessionState& state) {
    log.pair(QStringLiteral("KeSherLaSharat"), QString::number(state.transfer.KeSherLaSharat));
    log.pair(QStringLiteral("HitKasherDerech"), state.transfer.HitKasherDerech);
    log.text(QStringLiteral("TaooyotBaHaShvaa")).number(state.transfer.TaooyotBaHaShvaa).endLine();
    log.pair(QString(12, u'-'), QString(9, u'-'));
}

// From the serial to the fit: the same lines in a plain and in an edited order.
void writeDetails(ListOutput& log, const OrderDetails& shemot) {
    log.pair(QStringLiteral("Shemot.ser"), shemot.ser);
    log.pair(QStringLiteral("Shemot.n1"), shemot.n1);
    log.pair(QStringLiteral("Shemot.n2"), shemot.n2);
    log.pair(QStringLiteral("Shemot.n3"), shemot.n3);
    log.pair(QStringLiteral("Shemot.n4"), shemot.n4);
    log.text(QStringLiteral("Shemot.TotalPics")).number(shemot.TotalPics).endLine();
    log.pair(QStringLiteral("Shemot.Mail"), shemot.Mail);
    log.pair(QStringLiteral("Shemot.TimeOfJob"), shemot.TimeOfJob);
    log.pair(QStringLiteral("Shemot.Hearot"), shemot.Hearot);
    log.pair(QStringLiteral("Shemot.ppr"), shemot.ppr);
    log.text(QStringLiteral("Shemot.T1")).date(shemot.T1).endLine();
    log.pair(QStringLiteral("Shemot.Bord"), shemot.Bord);
    log.pair(QStringLiteral("Shemot.maat"), shemot.maat);
    log.pair(QStringLiteral("Shemot.FillFit"), shemot.FillFit);
}

void writePrintHead(ListOutput& log, const SessionState& state, const QDateTime& now) {
    log.pair(QStringLiteral("00"), QStringLiteral("00"));
    writeServerLines(log, state);
    log.pair(QStringLiteral("Shemot.Girsa"), state.shemot.Girsa);
    log.text(QStringLiteral("Time")).date(now).endLine();
    log.pair(QStringLiteral("Hazmana"), orderName(state));
    log.text(QStringLiteral("Optint")).number(static_cast<std::int16_t>(state.Optint)).endLine();
    writeDetails(log, state.shemot);
}

// The extras are numbered from 1 here, from 0 in the session's lists: the last place of each list never travels.
void writeAlbumHead(ListOutput& log, const SessionState& state, const QDateTime& now) {
    const AlbumDetails& album = state.album;
    log.pair(QStringLiteral("00"), QStringLiteral("00"));
    log.pair(QStringLiteral("00"), QStringLiteral("00"));
    writeServerLines(log, state);
    log.pair(QStringLiteral("Girsa"), state.shemot.Girsa);
    log.text(QStringLiteral("Time")).date(now).endLine();
    log.pair(QStringLiteral("Hazmana"), orderName(state));
    log.text(QStringLiteral("Optint")).number(static_cast<std::int16_t>(state.Optint)).endLine();
    log.pair(QStringLiteral("ser"), state.shemot.ser);
    log.text(QStringLiteral("TotalPics")).number(state.shemot.TotalPics).endLine();
    log.pair(QStringLiteral("GodelLBM"), album.GodelLBM);
    log.pair(QStringLiteral("Hearot"), album.HearotLBM);
    log.pair(QStringLiteral("MailZalam"), album.MailZalam);
    log.pair(QStringLiteral("ShemErooa"), album.ShemErooa);
    log.pair(QStringLiteral("ShemZalam"), album.ShemZalam);
    log.pair(QStringLiteral("SoogKricha"), album.SoogKricha);
    log.pair(QStringLiteral("SoogLBM"), album.SoogLBM);
    log.pair(QStringLiteral("SoogNiar"), album.SoogNiar);
    for (std::size_t i = 1; i < album.Tosafot1.size(); ++i)
        log.pair(QStringLiteral("Tosafot1_%1").arg(i), album.Tosafot1[i - 1]);
    for (std::size_t i = 1; i < album.Tosafot2.size(); ++i)
        log.pair(QStringLiteral("Tosafot2_%1").arg(i), album.Tosafot2[i - 1]);
}

void writeStars(ListOutput& log) {
    log.pair(QStringLiteral("***"), stars);
}

void writeItems(ListOutput& log, const QStringList& items) {
    for (const QString& item : items)
        log.pair(QStringLiteral("Shoora"), item);
}

void writeTail(ListOutput& log, const QStringList& items, const QStringList& failed) {
    const auto blank = [&log] { log.text(QStringLiteral(" ")).endLine(); };
    log.pair(QStringLiteral("-----------Total Failed"), QString::number(failed.size()) + QString(11, u'-'));
    blank();
    for (const QString& path : failed)
        log.pair(QStringLiteral("fail_"), path);
    blank();
    log.pair(QStringLiteral("-----------End"), QStringLiteral("Of Failed List-------------"));
    blank();
    log.pair(QString(11, u'-'), QString(30, u'-'));
    blank();
    writeItems(log, items);
}

} // namespace

QByteArray plainOrderLog(const SessionState& state, const QStringList& items, const QStringList& failed,
                         const QDateTime& now) {
    ListOutput log;
    if (state.Optint == OrderKind::Album)
        writeAlbumHead(log, state, now);
    else
        writePrintHead(log, state, now);
    log.text(QStringLiteral("More Comp = ")).number(state.DchisaAmoka).endLine();
    writeStars(log);
    writeTail(log, items, failed);
    return log.bytes();
}

// The kind of order is always told as 5, whatever the session holds: the lab's reader of this form knows no other.
QByteArray editedOrderLog(const SessionState& state, const QStringList& items, const QStringList& failed,
                          const QDateTime& now) {
    ListOutput log;
    log.pair(QStringLiteral("KeSherLaSharat = "), QString::number(state.transfer.KeSherLaSharat));
    log.pair(QStringLiteral("HitKasherDerech = "), state.transfer.HitKasherDerech);
    log.text(QStringLiteral("TaooyotBaHaShvaa = ")).number(state.transfer.TaooyotBaHaShvaa).endLine();
    log.pair(QStringLiteral("00"), QStringLiteral("00"));
    log.pair(QStringLiteral("Shemot.Girsa"), state.shemot.Girsa);
    log.text(QStringLiteral("Time")).date(now).endLine();
    log.pair(QStringLiteral("Hazmana"), orderName(state));
    log.pair(QStringLiteral("Option"), QStringLiteral("5"));
    writeDetails(log, state.shemot);
    writeStars(log);
    log.pair(QStringLiteral("***"), QStringLiteral("****    Failed    ***************************"));
    for (const QString& path : failed)
        log.pair(QStringLiteral("Failed  "), path);
    writeStars(log);
    writeItems(log, items);
    return log.bytes();
}

} // namespace lumora
