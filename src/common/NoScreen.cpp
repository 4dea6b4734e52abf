#include "common/NoScreen.h"

#include <QString>
#include <QtGlobal>

#include <cstdio>

namespace lumora {

using namespace Qt::StringLiterals;

void goWithoutScreen() {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    // Qt looks for a screen's socket in XDG_RUNTIME_DIR all the same, which a user of sudo or of a script has not got.
    qInstallMessageHandler([](QtMsgType type, const QMessageLogContext&, const QString& text) {
        if (type != QtWarningMsg || !text.startsWith("QStandardPaths: "_L1))
            std::fprintf(stderr, "%s\n", qPrintable(text));
    });
}

} // namespace lumora
