#pragma once

#include "common/Result.h"
#include "order/PrintFile.h"

#include <QStringList>

#include <filesystem>

namespace lumora {

// What was found in an order folder, read from its files alone as the lab reads it.
struct OrderFindings {
    QString order;      // order name from the log
    int items = 0;      // basket lines
    int prints = 0;     // print files that unpack to a whole picture
    int failed = 0;     // pictures that the log reports as failed
    int copies = 0;     // sum over all basket lines
    QStringList faults; // one sentence for each contradiction; empty when there is none
};

// Checks that every print file unpacks to a whole JPEG picture, that names, tails and total agree with the log, that
// each basket line has a print file or is reported as failed, and that the order sheet is there. Fails when the folder
// or its log can't be read.
Result<OrderFindings> checkOrderFolder(const std::filesystem::path& folder, PrintFileShape shape);

// Fails unless the bytes are one whole JPEG picture.
Result<void> checkWholeJpeg(const QByteArray& bytes);

// The bytes of a file on this machine. The failure tells a missing file from one that may not be read.
Result<QByteArray> readHostFile(const std::filesystem::path& path);

} // namespace lumora
