#include "platform/files/HostPath.h"

#include <QByteArray>

namespace lumora {
namespace {

// A file name is bytes, which on a camera's card need not be UTF-8. Each such byte becomes the lone low surrogate
// U+DC00 + byte, which no valid text holds, so that the conversion back gives the same bytes. A backslash in a name is
// converted likewise, since it separates the names of a drive path. The code page has "?" for both.
constexpr char16_t escapeBase = 0xDC00;
constexpr char16_t escapedBackslash = escapeBase + u'\\';

bool isEscape(char16_t unit) {
    return unit == escapedBackslash || (unit >= escapeBase + 0x80 && unit <= escapeBase + 0xFF);
}

int sequenceLength(unsigned char lead) {
    if (lead < 0x80)
        return 1;
    if (lead < 0xC2)
        return 0;
    if (lead < 0xE0)
        return 2;
    if (lead < 0xF0)
        return 3;
    return lead < 0xF5 ? 4 : 0;
}

} // namespace

QString toText(const HostPath& path) {
    const QByteArray bytes = QByteArray::fromStdString(path.native());
    if (const QString text = QString::fromUtf8(bytes); text.toUtf8() == bytes)
        return text;
    QString text;
    for (qsizetype i = 0; i < bytes.size();) {
        const auto lead = static_cast<unsigned char>(bytes[i]);
        const QByteArray sequence = bytes.mid(i, sequenceLength(lead));
        const QString decoded = QString::fromUtf8(sequence);
        if (!sequence.isEmpty() && decoded.toUtf8() == sequence) {
            text += decoded;
            i += sequence.size();
        } else {
            text += QChar(static_cast<char16_t>(escapeBase + lead));
            ++i;
        }
    }
    return text;
}

HostPath toHostPath(const QString& text) {
    QByteArray bytes;
    QString plain;
    for (qsizetype i = 0; i < text.size(); ++i) {
        const QChar c = text[i];
        const bool paired = i > 0 && text[i - 1].isHighSurrogate();
        if (!paired && isEscape(c.unicode())) {
            bytes += plain.toUtf8();
            bytes += static_cast<char>(c.unicode() - escapeBase);
            plain.clear();
        } else {
            plain += c;
        }
    }
    bytes += plain.toUtf8();
    return HostPath(bytes.toStdString());
}

QString toDriveName(const HostPath& name) {
    return toText(name).replace(u'\\', QChar(escapedBackslash));
}

} // namespace lumora
