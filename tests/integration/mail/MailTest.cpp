#include "finished/mail/MailResult.h"
#include "platform/line/SmtpMail.h"
#include "support/LabServers.h"
#include "support/MailServer.h"

#include <Poco/Net/ServerSocket.h>
#include <Poco/Net/StreamSocket.h>

#include <QElapsedTimer>
#include <QFile>

#include <gtest/gtest.h>

#include <thread>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

// What a mail program finds in the last message of a mailbox: four files in the folder.
const char* const mailProgram = R"(
import mailbox, sys, os
from email import policy, message_from_bytes
box, out = sys.argv[1:]
messages = mailbox.mbox(box)
message = message_from_bytes(messages.get_bytes(len(messages) - 1), policy=policy.default)
file = next(message.iter_attachments())
write = lambda name, data: open(os.path.join(out, name), "wb").write(data)
write("subject", message["subject"].encode())
write("body", message.get_body().get_content().encode())
write("name", file.get_filename().encode())
write("file", file.get_payload(decode=True))
assert not message.defects and not file.defects
assert message["from"].addresses[0].addr_spec == "kiosk@shop.example"
assert message["to"].addresses[0].addr_spec == "orders@lab.example"
)";

QByteArray contentOf(const QString& path) {
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly)) << path.toStdString();
    return file.readAll();
}

class MailTest : public testing::Test {
protected:
    MailTest() {
        message.subject = u"הזמנה של סבתא רבקה כהן-לוי, 21 בנובמבר, שלושים תמונות 10/15"_s;
        message.body = u"רבקה כהן-לוי\n03-5551234\n.\nFrom the sea, no. 5\n"_s;
        message.attachment = fileOf(3 << 20, u"תמונה של \"הים\" 001.jpp"_s);
    }
    ~MailTest() override { qunsetenv("SSL_CERT_FILE"); }

    HostPath fileOf(int bytes, const QString& name) {
        QByteArray content(bytes, Qt::Uninitialized);
        for (int i = 0; i < bytes; ++i)
            content[i] = static_cast<char>(i * 31 + i / 256);
        QFile file(folder.filePath(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        EXPECT_EQ(file.write(content), bytes);
        return toHostPath(file.fileName());
    }

    // The code of the end; said stands in what is told for a log.
    void expectEnd(int code, const MailAccount& account, const char* said) {
        const MailOutcome outcome = mail.send(account, message);
        EXPECT_EQ(MailResultCode(outcome.end), code) << outcome.words.toStdString();
        EXPECT_TRUE(outcome.words.contains(QLatin1String(said))) << outcome.words.toStdString();
    }

    QTemporaryDir folder;
    MailMessage message;
    SmtpMail mail{TimeLimits{Poco::Timespan(60, 0), Poco::Timespan(60, 0)}};
};

TEST_F(MailTest, AFileArrivesByteForByteWithSubjectBodyAndName) {
    const MailServer server;
    ASSERT_TRUE(server.running()) << server.failure().toStdString();
    qputenv("SSL_CERT_FILE", server.authority().toLocal8Bit());
    for (const MailEncryption encryption : {MailEncryption::None, MailEncryption::StartTls, MailEncryption::Tls}) {
        const MailOutcome outcome = mail.send(server.account(encryption), message);
        ASSERT_EQ(outcome.end, MailEnd::Sent) << int(encryption) << outcome.words.toStdString();
        const QString box = folder.filePath(u"box"_s);
        QFile file(box);
        ASSERT_TRUE(file.open(QIODevice::WriteOnly | QIODevice::Truncate));
        file.write(server.mailbox());
        file.close();
        QProcess reading;
        reading.setProcessChannelMode(QProcess::MergedChannels);
        reading.start(u"/usr/bin/python3"_s, {u"-c"_s, QString::fromUtf8(mailProgram), box, folder.path()});
        ASSERT_TRUE(reading.waitForFinished(60'000));
        ASSERT_EQ(reading.exitCode(), 0) << reading.readAll().toStdString();
        EXPECT_EQ(contentOf(folder.filePath(u"subject"_s)), message.subject.toUtf8());
        EXPECT_EQ(QString::fromUtf8(contentOf(folder.filePath(u"body"_s))).remove(u'\r'), message.body);
        EXPECT_EQ(contentOf(folder.filePath(u"name"_s)), toText(message.attachment.filename()).toUtf8());
        EXPECT_TRUE(contentOf(folder.filePath(u"file"_s)) == contentOf(toText(message.attachment)));
        QFile::remove(folder.filePath(u"file"_s));
    }
    // Encrypted where that was asked for, and logged in each time.
    const QByteArray log = server.log();
    EXPECT_EQ(log.count("P=esmtpa "), 1) << log.toStdString();
    EXPECT_EQ(log.count("P=esmtpsa "), 2) << log.toStdString();
    for (const char* way : {" A=proof:kiosk", " A=plain:kiosk", " A=login:kiosk"})
        EXPECT_EQ(log.count(way), 1) << way << log.toStdString();
}

TEST_F(MailTest, EachRefusalHasItsCode) {
    const MailServer server;
    const MailServer full(MailServer::Disk::Full);
    ASSERT_TRUE(server.running() && full.running()) << (server.failure() + full.failure()).toStdString();

    MailAccount wrong = server.account();
    wrong.to = u"nobody@lab.example"_s;
    expectEnd(14, wrong, "Unrouteable");
    wrong = server.account();
    wrong.to = u"orders@lab.example>\r\nRCPT TO:<else@else.example"_s;
    expectEnd(14, wrong, "no mail address");
    wrong = server.account();
    wrong.password = u"guessed"_s;
    expectEnd(6, wrong, "535");
    EXPECT_FALSE(mail.send(wrong, message).words.contains(wrong.password));
    expectEnd(4, full.account(), "452");
    wrong = server.account();
    wrong.port = FreePort();
    expectEnd(3, wrong, "refused");

    message.attachment = fileOf(MailServer::largestMessage, u"large.jpp"_s);
    expectEnd(18, server.account(), "552");
    message.attachment = toHostPath(folder.filePath(u"gone.jpp"_s));
    expectEnd(11, server.account(), "gone.jpp");
    message.attachment = toHostPath(folder.path());
    expectEnd(12, server.account(), "");

    EXPECT_TRUE((server.mailbox() + full.mailbox()).isEmpty());
}

TEST_F(MailTest, NothingGoesToAServerThatIsNotProved) {
    const MailServer server;
    const MailServer open(MailServer::Disk::WithRoom, MailServer::Encryption::None);
    ASSERT_TRUE(server.running() && open.running()) << (server.failure() + open.failure()).toStdString();
    for (const MailEncryption encryption : {MailEncryption::StartTls, MailEncryption::Tls})
        expectEnd(3, server.account(encryption), "certificate");
    // The certificate is for the address, and this is another name for it.
    qputenv("SSL_CERT_FILE", server.authority().toLocal8Bit());
    for (const MailEncryption encryption : {MailEncryption::StartTls, MailEncryption::Tls}) {
        MailAccount renamed = server.account(encryption);
        renamed.host = u"localhost"_s;
        expectEnd(3, renamed, "ertificate");
    }
    expectEnd(3, open.account(MailEncryption::StartTls), "no encryption");
    const QByteArray log = server.log() + open.log();
    EXPECT_FALSE(log.contains("kiosk")) << log.toStdString();
}

// Answers each line with the next reply and then falls silent, or hangs up.
class ScriptedServer {
public:
    enum class Then { Silent, HangUp };
    ScriptedServer(std::vector<std::string> replies, Then then)
        : m_listening(Poco::Net::SocketAddress("127.0.0.1", 0))
        , m_thread([this, replies = std::move(replies), then] {
            Poco::Net::StreamSocket client = m_listening.acceptConnection();
            char bytes[4096];
            for (const std::string& reply : replies) {
                client.sendBytes(reply.data(), static_cast<int>(reply.size()));
                if (client.receiveBytes(bytes, sizeof bytes) <= 0)
                    return;
            }
            try {
                while (then == Then::Silent && client.receiveBytes(bytes, sizeof bytes) > 0) {
                }
            } catch (const std::exception&) {
                // The client has gone, with bytes of ours unread.
            }
        }) {}
    ~ScriptedServer() { m_thread.join(); }
    quint16 port() const { return m_listening.address().port(); }

private:
    Poco::Net::ServerSocket m_listening;
    std::thread m_thread;
};

TEST_F(MailTest, AServerThatFallsSilentOrLeavesIsNoContact) {
    const std::vector<std::string> whole = {"220 here\r\n", "250 good\r\n", "250 good\r\n", "250 good\r\n",
                                            "354 go\r\n"};
    const std::vector<std::string> startTls = {"220 here\r\n", "250-good\r\n250 STARTTLS\r\n", "220 go\r\n"};
    mail = SmtpMail(TimeLimits{Poco::Timespan(0, 300'000), Poco::Timespan(0, 200'000)});
    const auto expectNoContact = [&](MailEncryption encryption, const std::vector<std::string>& replies,
                                     ScriptedServer::Then then) {
        const ScriptedServer server(replies, then);
        MailAccount account;
        account.host = u"127.0.0.1"_s;
        account.port = server.port();
        account.encryption = encryption;
        account.from = account.to = u"a@lab.example"_s;
        QElapsedTimer time;
        time.start();
        expectEnd(3, account, "");
        EXPECT_LT(time.elapsed(), 15'000) << int(encryption) << " after " << replies.size();
    };
    for (const auto then : {ScriptedServer::Then::Silent, ScriptedServer::Then::HangUp}) {
        for (std::size_t replies = 0; replies <= whole.size(); ++replies)
            expectNoContact(MailEncryption::None, {whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(replies)},
                            then);
        expectNoContact(MailEncryption::StartTls, startTls, then);
        expectNoContact(MailEncryption::Tls, {}, then);
    }
}

} // namespace
} // namespace lumora
