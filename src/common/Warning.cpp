#include "common/Warning.h"

#include "common/StationLog.h"

#include <cstdio>

namespace lumora {

using namespace Qt::StringLiterals;

void writeWarning(const QString& text) {
    if (!isLoggedFromStandardError())
        std::fprintf(stderr, "lumora: %s\n", qPrintable(text));
    writeLog(u"warning: "_s + withoutCustomer(text));
}

} // namespace lumora
