#include "common/Warning.h"

#include <cstdio>

namespace lumora {

void writeWarning(const QString& text) {
    std::fprintf(stderr, "lumora: %s\n", qPrintable(text));
}

} // namespace lumora
