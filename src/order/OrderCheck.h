#pragma once

#include "common/Result.h"
#include "order/PrintFile.h"

#include <QStringList>

#include <filesystem>

namespace lumora {

// What an order folder holds, read as the lab reads it: from the files alone.
struct OrderFindings {
    QString order;      // name of the order in its log
    int items = 0;      // lines of the basket
    int prints = 0;     // print files that unpack to a whole picture
    int failed = 0;     // pictures that the log names as failed
    int copies = 0;     // of all lines
    QStringList faults; // what does not hold together, one sentence each; empty when all is well
};

// Checks that every print file unpacks to a whole JPEG, that names, tails and total agree with the log, that each line
// of the basket has its print file or is named as failed, and that the order sheet is there. Fails when the folder or
// its log can't be read at all.
Result<OrderFindings> checkOrderFolder(const std::filesystem::path& folder, PrintFileShape shape);

// Whether the bytes are one whole JPEG picture.
Result<void> checkWholeJpeg(const QByteArray& bytes);

// The bytes of a file of this machine.
Result<QByteArray> readHostFile(const std::filesystem::path& path);

} // namespace lumora
