#include "imaging/drawing/QrCode.h"

#include <QPainter>

#include <qrencode.h>

#include <memory>

namespace lumora {

namespace {

constexpr int emptyEdge = 4; // modules

} // namespace

Bitmap qrCode(const QString& text, int modulePixels) {
    const QByteArray bytes = text.toUtf8();
    const std::unique_ptr<QRcode, decltype(&QRcode_free)> code(
        QRcode_encodeString8bit(bytes.constData(), 0, QR_ECLEVEL_M), &QRcode_free);
    if (!code)
        return {};
    const int modules = code->width;
    Bitmap drawn((modules + 2 * emptyEdge) * modulePixels, (modules + 2 * emptyEdge) * modulePixels, Qt::white);
    if (drawn.isNull())
        return drawn;
    QPainter painter(&drawn.image());
    for (int i = 0; i < modules * modules; ++i) {
        const bool isBlack = (code->data[i] & 1) != 0;
        if (isBlack)
            painter.fillRect((i % modules + emptyEdge) * modulePixels, (i / modules + emptyEdge) * modulePixels,
                             modulePixels, modulePixels, Qt::black);
    }
    return drawn;
}

} // namespace lumora
