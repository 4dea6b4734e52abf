#include "platform/line/PocoInternet.h"
#include "support/FtpFrmRig.h"
#include "support/ScriptedServer.h"

#include <gtest/gtest.h>

#include <map>

namespace lumora {
namespace {

using Poco::Net::StreamSocket;

// A lab's FTP server that notes what it is asked.
class NotingLab {
public:
    // What is answered in place of the reply to a command, or to its data ("STOR end"). Empty: the command is carried
    // out and the line is cut. No value: the lab's own reply.
    std::function<std::optional<QByteArray>(const QByteArray& command)> instead;
    QStringList asked{};
    std::map<QString, QByteArray> order; // the files in the order's folder

    QString host() const { return u"127.0.0.1:%1"_s.arg(m_server->port()); }
    void end() { m_server.reset(); }

private:
    void talk(StreamSocket& control) {
        control.setNoDelay(true);
        m_inside = 0;
        QByteArray line = "CONNECT";
        for (char c = 0; obey(control, line); line.chop(2)) {
            for (line.clear(); !line.endsWith("\r\n"); line += c) {
                if (control.receiveBytes(&c, 1) != 1)
                    return;
            }
        }
    }
    // False: the line is cut.
    bool obey(StreamSocket& control, const QByteArray& line) {
        asked += QString::fromLatin1(line);
        const QByteArray word = line.split(' ').first();
        const QString name = QString::fromLatin1(line.mid(word.size() + 1));
        if (!answer(control, word, [&] { return carryOut(word, name); }))
            return false;
        if (m_refused || (word != "LIST" && word != "STOR"))
            return word != "QUIT";
        StreamSocket data = m_data.acceptConnection();
        QByteArray bytes = word == "LIST" ? listing() : QByteArray();
        data.sendBytes(bytes.constData(), static_cast<int>(bytes.size()));
        data.shutdownSend();
        for (char c = 0; data.receiveBytes(&c, 1) == 1;)
            bytes += c;
        if (word == "STOR")
            order[name] = bytes;
        return answer(control, word + " end", [] { return QByteArray("226 done"); });
    }
    bool answer(StreamSocket& control, const QByteArray& command, const std::function<QByteArray()>& own) {
        const std::optional<QByteArray> other = instead ? instead(command) : std::nullopt;
        m_refused = other && !other->isEmpty();
        const QByteArray text = (m_refused ? *other : own()) + "\r\n";
        if (other && !m_refused)
            return false;
        control.sendBytes(text.constData(), static_cast<int>(text.size()));
        return true;
    }
    QByteArray carryOut(const QByteArray& word, const QString& name) {
        static const std::map<QByteArray, QByteArray> replies = {
            {"USER", "331 a"}, {"LIST", "150 a"}, {"STOR", "150 a"}, {"PASV", "500 a"}};
        if (word == "PWD")
            return m_inside == 0 ? "257 \"/\"" : "257 \"/zalamim234\"";
        if (word == "EPSV") {
            m_data = Poco::Net::ServerSocket(Poco::Net::SocketAddress("127.0.0.1", 0));
            return "229 a (|||" + QByteArray::number(m_data.address().port()) + "|)";
        }
        if ((word == "CWD" && m_inside == 1 && !m_made) ||
            ((word == "SIZE" || word == "DELE") && !order.contains(name)))
            return "550 none";
        m_inside += word == "CWD" ? 1 : 0;
        m_made = m_made || word == "MKD";
        if (word == "SIZE")
            return "213 " + QByteArray::number(order[name].size());
        if (word == "DELE")
            order.erase(name);
        const auto reply = replies.find(word);
        return reply == replies.end() ? "200 a" : reply->second;
    }
    QByteArray listing() const {
        const QString folder = m_inside == 0 ? u"zalamim234"_s : FtpFrmRig::name();
        QString lines = m_inside == 0 || (m_inside == 1 && m_made)
                            ? u"drwxr-xr-x 1 a a 0 Nov 22 01:02 %1\r\n"_s.arg(folder)
                            : QString();
        for (const auto& [name, bytes] : order)
            lines +=
                m_inside < 2 ? QString() : u"-rw-r--r-- 1 a a %1 Nov 22 01:02 %2\r\n"_s.arg(bytes.size()).arg(name);
        return lines.toLatin1();
    }

    int m_inside = 0; // folders entered
    bool m_made = false;
    bool m_refused = false;
    Poco::Net::ServerSocket m_data;
    std::optional<ScriptedServer> m_server{[this](StreamSocket& control) { talk(control); }};
};

// An order of two prints before that lab.
struct Line {
    explicit Line(bool careful = true, bool kept = true, FtpType type = FtpType::Ascii)
        : internet({}, type) {
        rig.state.Careful = careful;
        rig.state.profile.FtpServer = lab.host();
        rig.state.profile.ReportOn = 0;
        rig.state.transfer.keptFtpSession = kept;
    }
    // What the order ends as.
    SendingPhase send() {
        rig.send();
        internet.abort();
        lab.end();
        return rig.page().phase();
    }
    bool isWhole() const {
        auto files = rig.localFiles();
        files.erase(u"kashloo.txt"_s);
        return lab.order == files;
    }

    NotingLab lab;
    PocoInternet internet;
    FtpFrmRig rig{internet};
};

const QList<QByteArray> others = {"550 no", "450 later", {}};

TEST(FtpCommands, AWholeOrderAsksForThisAndNoMore) {
    const QString name = FtpFrmRig::name(), passive = u"EPSV|LIST|"_s, enter = u"CWD "_s + name + u'|';
    for (const auto& [careful, kept, type] : {std::tuple(true, false, 'A'),
                                              {true, true, 'A'},
                                              {true, true, 'I'},
                                              {false, false, 'A'},
                                              {false, true, 'A'}}) {
        SCOPED_TRACE(std::string(careful ? "careful " : "") + (kept ? "kept " : "") + type);
        Line line(careful, kept, type == 'A' ? FtpType::Ascii : FtpType::Image);
        EXPECT_EQ(line.send(), SendingPhase::Success);
        EXPECT_TRUE(line.isWhole());
        const QString typed = u"TYPE %1|"_s.arg(QLatin1Char(type)), image = type == 'A' ? u"TYPE I|"_s : QString();
        const QString walk =
            u"CONNECT|USER lumora|PASS morvex482|PWD|"_s + typed + passive + u"CWD zalamim234|"_s + passive + u"PWD|"_s;
        QString expected;
        for (const QString& file : FtpFrmRig::names()) {
            const bool first = file == FtpFrmRig::log();
            const QString make = u"MKD "_s + name + u'|';
            if (kept && first)
                expected += u"CONNECT|USER lumora|PASS morvex482|PWD|CWD zalamim234|PWD|"_s + enter + make + enter +
                            typed + (careful ? passive : QString());
            else if (!kept)
                expected +=
                    walk + (first ? make + passive : QString()) + enter + (careful || !first ? passive : QString());
            expected += u"EPSV|STOR "_s + file + u'|';
            if (first && careful)
                expected += kept && type == 'A' ? passive : image + u"SIZE "_s + file + u'|';
            expected += kept ? QString() : u"QUIT|"_s;
        }
        expected += (kept ? passive : walk + enter + passive) + u"QUIT"_s;
        EXPECT_EQ(line.lab.asked.join(u'|').toStdString(), expected.toStdString());
    }
}

TEST(FtpCommands, AReplyThatIsReplacedOnceCostsNoFileAndNoOther) {
    for (const QByteArray& other : others) {
        QByteArray at = "CONNECT";
        for (int nth = 1; !at.isEmpty(); ++nth) {
            at.clear();
            Line line;
            line.lab.instead = [&, replies = 0](const QByteArray& command) mutable {
                if (++replies == nth)
                    at = command;
                return replies == nth ? std::optional(other) : std::nullopt;
            };
            EXPECT_TRUE(line.send() == SendingPhase::Success && line.isWhole())
                << nth << ' ' << at.toStdString() << ' ' << other.toStdString();
            EXPECT_EQ(line.lab.asked.filter(u"STOR"_s).size(), at.startsWith("STOR") ? 6 : 5)
                << nth << other.toStdString();
            EXPECT_TRUE(!at.isEmpty() || nth > 30);
        }
    }
}

TEST(FtpCommands, AnOrderEndsWhereACommandIsNeverAnsweredWell) {
    using enum SendingPhase;
    for (const auto& [commands, refused, cut] :
         {std::tuple(u"CONNECT|USER|PASS|PWD|TYPE|EPSV|CWD|STOR|STOR end"_s, NotAll, NotAll),
          {u"LIST|LIST end"_s, Unclear, NotAll},
          {u"MKD"_s, NotAll, Success},
          {u"SIZE"_s, Success, Success}}) {
        for (const QString& command : commands.split(u'|')) {
            for (const QByteArray& other : others) {
                Line line;
                line.lab.instead = [&](const QByteArray& asked) {
                    return asked == command.toLatin1() ? std::optional(other) : std::nullopt;
                };
                const SendingPhase end = other.isEmpty() ? cut : refused;
                EXPECT_EQ(line.send(), end) << command.toStdString() << ' ' << other.toStdString();
                EXPECT_EQ(line.isWhole(), end == Success || end == Unclear)
                    << command.toStdString() << ' ' << other.toStdString();
            }
        }
    }
}

} // namespace
} // namespace lumora
