#include "order/OrderDetailsReader.h"

#include "order/OrderLog.h"
#include "platform/files/Files.h"

#include <array>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array textFields = {&OrderDetails::n1,     &OrderDetails::n2,   &OrderDetails::ppr,
                                   &OrderDetails::Hearot, &OrderDetails::Mail, &OrderDetails::FillFit,
                                   &OrderDetails::maat,   &OrderDetails::Bord};

void setAll(OrderDetails& details, const QString& text) {
    for (const auto field : textFields)
        details.*field = text;
    details.TotalPics = 0;
}

// Reads the log and copies the customer's fields into details, except from an album's log, which lacks them.
std::optional<OrderLog> readLog(const Files& files, const DrivePath& path, OrderDetails& details) {
    const auto bytes = files.fileExists(path) ? files.read(path) : Failure{Failure::Kind::NotFound, path.text()};
    if (!bytes) {
        setAll(details, u"NO details"_s);
        return std::nullopt;
    }
    OrderLog log;
    log.shemot = details;
    log.read(*bytes);
    if (log.layout != OrderLog::Layout::Album) {
        for (const auto field : textFields)
            details.*field = log.shemot.*field;
        details.TotalPics = log.shemot.TotalPics;
    }
    return log;
}

// The same with the fields cleared before, and with what an album's log has of them.
std::optional<OrderLog> readResent(const Files& files, const DrivePath& path, OrderDetails& details) {
    setAll(details, {});
    auto log = readLog(files, path, details);
    if (log && log->layout == OrderLog::Layout::Album) {
        details.n1 = log->album.ShemZalam;
        details.ppr = log->album.GodelLBM;
        details.Mail = log->album.MailZalam;
        details.TotalPics = log->shemot.TotalPics;
    }
    return log;
}

} // namespace

void ReadOrderDetails(const Files& files, const DrivePath& path, OrderDetails& details) {
    readLog(files, path, details);
}

void ReadResentDetails(const Files& files, const DrivePath& path, OrderDetails& details) {
    readResent(files, path, details);
}

void ReadReportDetails(const Files& files, const DrivePath& path, OrderDetails& details) {
    details.n3.clear();
    const auto log = readResent(files, path, details);
    if (!log)
        return;
    if (log->layout == OrderLog::Layout::Album)
        details.Hearot = log->album.HearotLBM;
    else
        details.n3 = log->shemot.n3;
}

} // namespace lumora
