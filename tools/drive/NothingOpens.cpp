#include "drive/NothingOpens.h"

#include <QDesktopServices>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QStringList schemes{u"http"_s, u"https"_s, u"file"_s, u"mailto"_s};

} // namespace

NothingOpens::NothingOpens() {
    for (const QString& scheme : schemes)
        QDesktopServices::setUrlHandler(scheme, this, "take");
}

NothingOpens::~NothingOpens() {
    for (const QString& scheme : schemes)
        QDesktopServices::unsetUrlHandler(scheme);
}

} // namespace lumora
