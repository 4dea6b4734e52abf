#include "common/HostFile.h"
#include "finished/mail/MailResult.h"
#include "platform/line/SmtpMail.h"
#include "support/LabServers.h"
#include "support/MailServer.h"
#include "support/ScriptedServer.h"

#include <QElapsedTimer>
#include <QFile>

#include <gtest/gtest.h>

namespace lumora {
namespace {

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
        const HostPath path = toHostPath(folder.filePath(name));
        EXPECT_TRUE(writeWholeFile(path, content));
        return path;
    }

    // The code of the end; said stands in what is told for a log.
    void expectEnd(int code, const MailAccount& account, const char* said) {
        const MailOutcome outcome = mail.send(account, message);
        EXPECT_EQ(MailResultCode(outcome.end), code) << outcome.words.toStdString();
        EXPECT_TRUE(outcome.words.contains(QLatin1String(said))) << outcome.words.toStdString();
    }

    // The same at a server that answers each line with the next reply and then falls silent, or hangs up.
    void expectEnd(int code, const std::vector<std::string>& replies, const char* said, MailEncryption encryption,
                   bool silent = false) {
        const ScriptedServer server([&](Poco::Net::StreamSocket& client) {
            char bytes[4096];
            for (const std::string& reply : replies) {
                client.sendBytes(reply.data(), static_cast<int>(reply.size()));
                if (client.receiveBytes(bytes, sizeof bytes) <= 0)
                    return;
            }
            while (silent && client.receiveBytes(bytes, sizeof bytes) > 0) {
            }
        });
        MailAccount account;
        account.host = u"127.0.0.1"_s;
        account.port = server.port();
        account.encryption = encryption;
        account.from = account.to = u"a@lab.example"_s;
        expectEnd(code, account, said);
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
        ASSERT_TRUE(writeWholeFile(toHostPath(box), server.mailbox()));
        QProcess reading;
        reading.setProcessChannelMode(QProcess::MergedChannels);
        reading.start(QStringLiteral(LUMORA_READ_MAIL), {box, folder.path()});
        ASSERT_TRUE(reading.waitForFinished(60'000));
        ASSERT_EQ(reading.exitCode(), 0) << reading.readAll().toStdString();
        const HostPath there = toHostPath(folder.path());
        EXPECT_EQ(contentOf(there / "subject"), message.subject.toUtf8());
        EXPECT_EQ(QString::fromUtf8(contentOf(there / "body")).remove(u'\r'), message.body);
        EXPECT_EQ(contentOf(there / "name"), toText(message.attachment.filename()).toUtf8());
        EXPECT_TRUE(contentOf(there / "file") == contentOf(message.attachment));
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
    ASSERT_TRUE(server.running()) << server.failure().toStdString();

    const auto with = [&](QString MailAccount::*field, const QString& value) {
        MailAccount account = server.account();
        account.*field = value;
        return account;
    };
    expectEnd(14, with(&MailAccount::to, u"nobody@lab.example"_s), "Unrouteable");
    expectEnd(14, with(&MailAccount::to, u"orders@lab.example>\r\nRCPT TO:<else@else.example"_s), "no mail address");
    const MailAccount wrong = with(&MailAccount::password, u"guessed"_s);
    expectEnd(6, wrong, "535");
    EXPECT_FALSE(mail.send(wrong, message).words.contains(wrong.password));
    expectEnd(4, {"220 here\r\n", "250 good\r\n", "452 no room\r\n"}, "452", MailEncryption::None);
    MailAccount closed = server.account();
    closed.port = FreePort();
    expectEnd(3, closed, "refused");

    message.attachment = fileOf(MailServer::largestMessage, u"large.jpp"_s);
    expectEnd(18, server.account(), "552");
    message.attachment = toHostPath(folder.filePath(u"gone.jpp"_s));
    expectEnd(11, server.account(), "gone.jpp");
    message.attachment = toHostPath(folder.path());
    expectEnd(12, server.account(), "");

    EXPECT_TRUE(server.mailbox().isEmpty());
}

TEST_F(MailTest, NothingGoesToAServerThatIsNotProved) {
    const MailServer server;
    ASSERT_TRUE(server.running()) << server.failure().toStdString();
    for (const MailEncryption encryption : {MailEncryption::StartTls, MailEncryption::Tls})
        expectEnd(3, server.account(encryption), "certificate");
    // The certificate is for the address, and this is another name for it.
    qputenv("SSL_CERT_FILE", server.authority().toLocal8Bit());
    for (const MailEncryption encryption : {MailEncryption::StartTls, MailEncryption::Tls}) {
        MailAccount renamed = server.account(encryption);
        renamed.host = u"localhost"_s;
        expectEnd(3, renamed, "ertificate");
    }
    expectEnd(3, {"220 here\r\n", "250-good\r\n250 AUTH PLAIN\r\n"}, "no encryption", MailEncryption::StartTls);
    EXPECT_FALSE(server.log().contains("kiosk")) << server.log().toStdString();
}

TEST_F(MailTest, AServerThatFallsSilentOrLeavesIsNoContact) {
    const std::vector<std::string> whole = {"220 here\r\n", "250 good\r\n", "250 good\r\n", "250 good\r\n",
                                            "354 go\r\n"};
    const std::vector<std::string> startTls = {"220 here\r\n", "250-good\r\n250 STARTTLS\r\n", "220 go\r\n"};
    mail = SmtpMail(TimeLimits{Poco::Timespan(0, 300'000), Poco::Timespan(0, 200'000)});
    const auto expectNoContact = [&](MailEncryption encryption, const std::vector<std::string>& replies, bool silent) {
        QElapsedTimer time;
        time.start();
        expectEnd(3, replies, "", encryption, silent);
        EXPECT_LT(time.elapsed(), 15'000) << int(encryption) << " after " << replies.size();
    };
    for (const bool silent : {true, false}) {
        for (std::size_t replies = 0; replies <= whole.size(); ++replies)
            expectNoContact(MailEncryption::None, {whole.begin(), whole.begin() + static_cast<std::ptrdiff_t>(replies)},
                            silent);
        expectNoContact(MailEncryption::StartTls, startTls, silent);
        expectNoContact(MailEncryption::Tls, {}, silent);
    }
}

} // namespace
} // namespace lumora
