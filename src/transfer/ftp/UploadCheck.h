#pragma once

#include "transfer/ftp/FtpSession.h"

namespace lumora {

// What arrived: after each pass the check reconnects from scratch, takes the remains of failed puts off the server and
// counts names. An order counts as sent when its folder on the server holds as many names as the order has files; the
// listing is the only evidence, neither sizes nor dates are compared.
class UploadCheck {
public:
    UploadCheck(FtpDesk& desk, FtpSession& session)
        : m_desk(desk)
        , m_board(desk.board)
        , m_session(session) {}

    // The steps that follow the pass of an attempt, 1 to 4. They differ in their pauses and closings alone.
    void check(int attempt);

    void ListServerFiles();
    void RecheckBroken();
    void DeleteBrokenFiles();
    void ConfirmBrokenGone();
    void RebuildMissing();

    // Takes out of List3 what List6 has already.
    void DropAlreadySent();

    // Files of the order that are not on the server, or only as the remains of a failed put.
    QStringList missing() const;

    // Names in List6 less those whose put failed: they are on the server, but not as sent files.
    std::int16_t NumOnServer = 0;
    bool freshCount = false; // the last ListServerFiles saw the order's folder; else its count is that of older lists

private:
    bool lookUp();
    void filterDots();
    void count();
    void tellCount(const QString& hebrew);
    bool nothingBroken() const { return m_board.List4Broken.isEmpty() || m_board.List6.isEmpty(); }
    void freshConnection();

    FtpDesk& m_desk;
    FtpBoard& m_board;
    FtpSession& m_session;
    bool m_freshListing = false; // List6 was read by the last RecheckBroken
};

} // namespace lumora
