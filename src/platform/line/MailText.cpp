#include "platform/line/MailText.h"

#include <Poco/Net/MessageHeader.h>
#include <Poco/Net/MultipartWriter.h>

#include <QByteArrayList>
#include <QDateTime>
#include <QList>
#include <QUuid>

#include <algorithm>
#include <sstream>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

bool plain(const QString& text) {
    return std::all_of(text.begin(), text.end(), [](QChar c) { return c.unicode() >= 0x20 && c.unicode() < 0x7F; });
}

// A word holds whole characters, and a line with one has at most 76 letters, the field's name among them.
QByteArray encodedWords(const QString& text) {
    constexpr qsizetype bytesOfWord = 39;
    QByteArrayList words;
    QByteArray word;
    for (const char32_t c : text.toUcs4()) {
        const QByteArray bytes = QString::fromUcs4(&c, 1).toUtf8();
        if (word.size() + bytes.size() > bytesOfWord) {
            words += word;
            word.clear();
        }
        word += bytes;
    }
    words += word;
    for (QByteArray& each : words)
        each = "=?UTF-8?B?" + each.toBase64() + "?=";
    return words.join("\r\n ");
}

QByteArray subjectField(const QString& subject) {
    constexpr qsizetype letters = 60; // more would have to be folded
    return plain(subject) && subject.size() <= letters && !subject.contains(u"=?") ? subject.toLatin1()
                                                                                   : encodedWords(subject);
}

QByteArray fileNameParameter(const QString& name) {
    if (plain(name) && !name.contains(u'"') && !name.contains(u'\\'))
        return "filename=\"" + name.toLatin1() + '"';
    return "filename*=UTF-8''" + name.toUtf8().toPercentEncoding();
}

void writeBase64(std::ostream& out, const QByteArray& bytes) {
    constexpr qsizetype bytesOfLine = 57; // 76 letters
    for (qsizetype at = 0; at < bytes.size(); at += bytesOfLine) {
        const QByteArray line =
            QByteArray::fromRawData(bytes.constData() + at, std::min(bytesOfLine, bytes.size() - at));
        out << line.toBase64().constData() << "\r\n";
    }
}

void writePart(Poco::Net::MultipartWriter& parts, std::ostream& out, const std::string& type,
               const QByteArray& disposition, const QByteArray& bytes) {
    Poco::Net::MessageHeader header;
    header.set("Content-Type", type);
    header.set("Content-Disposition", disposition.toStdString());
    header.set("Content-Transfer-Encoding", "base64");
    parts.nextPart(header);
    writeBase64(out, bytes);
}

} // namespace

std::string MailText(const MailAccount& account, const MailMessage& message, const QByteArray& attachment) {
    QString body = message.body;
    body.replace(u"\r\n"_s, u"\n"_s).replace(u'\n', u"\r\n"_s);

    std::ostringstream text;
    Poco::Net::MultipartWriter parts(text);
    const QString id = QUuid::createUuid().toString(QUuid::WithoutBraces);
    Poco::Net::MessageHeader head;
    head.set("Date", QDateTime::currentDateTime().toString(Qt::RFC2822Date).toStdString());
    head.set("From", account.from.toStdString());
    head.set("To", account.to.toStdString());
    head.set("Subject", subjectField(message.subject).toStdString());
    head.set("Message-ID", u"<%1@%2>"_s.arg(id, account.from.section(u'@', -1)).toStdString());
    head.set("MIME-Version", "1.0");
    head.set("Content-Type", "multipart/mixed; boundary=\"" + parts.boundary() + "\"");
    head.write(text);
    text << "\r\n";
    writePart(parts, text, "text/plain; charset=UTF-8", "inline", body.toUtf8());
    writePart(parts, text, "application/octet-stream",
              "attachment; " + fileNameParameter(toText(message.attachment.filename())), attachment);
    parts.close();
    return text.str();
}

} // namespace lumora
