#pragma once

#include "common/Result.h"
#include "order/OrderCheck.h"
#include "order/PrintFileName.h"

#include <QString>
#include <QStringList>

#include <filesystem>
#include <vector>

namespace lumora {

// An order as it lies at the lab.
struct ArrivedOrder {
    struct Print {
        QString file; // leaf name
        PrintFileName name;
        std::filesystem::path path;
    };
    QString name; // the folder's
    OrderFindings findings;
    QStringList missing; // a sentence each; empty when the order is whole
    std::vector<Print> prints;
    std::filesystem::path sheet;

    // Judges the order in the folder. What came in pieces is joined first, below room, an empty folder of the caller's,
    // which then stays as long as the prints are wanted. A fault of the order is told in missing; a failure is one of
    // this machine's.
    static Result<ArrivedOrder> judge(const std::filesystem::path& folder, PrintFileShape shape,
                                      const std::filesystem::path& room);
};

} // namespace lumora
