#include "session/lab/LabFile.h"

#include "common/HostFile.h"
#include "session/SessionState.h"
#include "session/lab/ClientProfile.h"

#include <QFile>
#include <QTemporaryDir>

#include <gtest/gtest.h>

namespace lumora {
namespace {

using namespace Qt::StringLiterals;

LabFileReading parse(const QByteArray& bytes) {
    return ParseLabFile(bytes, u"lab.ini"_s);
}

TEST(LabFileTest, AnEmptyFileLeavesTheDefaults) {
    const LabFileReading reading = parse("\xEF\xBB\xBF\r\n# nothing\r\n; nothing\r\n[Server]\r\n");
    EXPECT_TRUE(reading.errors.isEmpty()) << reading.errors.join(u'\n').toStdString();
    EXPECT_TRUE(reading.deployment == Deployment());
}

TEST(LabFileTest, ReadsKeysOfEverySection) {
    const LabFileReading reading =
        parse("[Server]\n"
              "Host = 127.0.0.1:2121\r\n"
              "Password = \" a;b#c=d \"\n"
              "Folder1 = \xD7\x90\n"
              "JppChunks=32767\n"
              "JppTail = 60\nType = i\nSession = kept\n"
              "[Client]\nLetter = AS\n"
              "[Paper]\nSizes = 10/15,20/30\nQuickSizes = 10/15, 13/18, 20/30\n"
              "[Switches]\nCoupon = YES\nQuickOrder = no\nSplitPage = yes\nReports = no\nDeepCompression = "
              "ask\nDeepCompressionAlbum = no\n"
              "BorderPage = no\nFitPage = yes\nOptionalMail = yes\nLocalStation = yes\nExtraTile = yes\n"
              "[Mail]\nServer = mail.lab.example\nPort = 2525\nUser = a@b\nPassword = x^y\nTls = TLS\n"
              "From = kiosk@lab.example\nTo = o'neil+orders@lab.example\n"
              "[Operator]\nArea = no\nEditor = yes\n[Look]\nContrast = yes\n[Texts]\nHelp = "
              "/srv/lab/עזרה.html\n[Door]\nCards = Watched\n[Kiosk]\nWaiting "
              "= yes\nKeyboard = Auto\n"
              "Mode = yes\nIdleSeconds = 3600\nKeepDays = 7\nKeepLogDays = 9999\nPrinter = slips\n[Log]\nKeep = yes\n"
              "[Shops]\nShop2Phone = 03-5\n"
              "[Branches]\nBranch10 = North\nBranch10Address2 = 2nd floor\n"
              "[Drives]\nProgramLetter = e\nDataFolder = /srv/lumora\nOrder = zd\n");
    ASSERT_TRUE(reading.errors.isEmpty()) << reading.errors.join(u'\n').toStdString();
    const Deployment& lab = reading.deployment;
    const ClientProfile& profile = lab.profile;
    EXPECT_EQ(QStringList({profile.FtpServer, profile.FtpPassword, profile.FtpFolder1, profile.SizeList[1],
                           profile.SizeList[2], profile.QuickSizes[2], profile.Shops[1].phone,
                           profile.Branches[9].caption, profile.Branches[9].address[1], profile.Branches[10].caption}),
              QStringList({"127.0.0.1:2121", " a;b#c=d ", "א", "20/30", "", "20/30", "03-5", "North", "2nd floor",
                           "משלוח לבית"}));
    EXPECT_EQ(profile.JppChunks, 32767);
    EXPECT_EQ(lab.texts.help, u"/srv/lab/עזרה.html");
    SessionState state;
    LoadDefaultProfile(state, lab);
    EXPECT_TRUE(state.coupon.SmallCount == 220 && state.coupon.LargeCount == 3);
    EXPECT_TRUE(lab.SugTzad == 60 && lab.ftpType == FtpType::Image && lab.HaKoopon == 1 && lab.MinuyPaar == 2);
    EXPECT_TRUE(lab.Waiting && state.Waiting && lab.watchedCards && lab.keptFtpSession && !lab.DchisatAlbum &&
                lab.SplitPage && lab.FitMuzag && lab.DoarReshut && lab.TachanaMekomit && !lab.OperatorArea &&
                lab.OperatorEditor && lab.contrast && lab.KeepLog && state.screenKeys == ScreenKeys::Touches);
    EXPECT_TRUE(lab.GvulMuzag == 0 && lab.TmunatPaar == 1 && profile.ReportOn == 0 && lab.MediniyutDchisa == 1);
    EXPECT_TRUE(state.kiosk == (KioskRules{true, 3600, {}, 7, 9999, u"slips"_s}));
    const MailAccount& mail = lab.profile.mail;
    EXPECT_EQ(QStringList({mail.host, mail.user, mail.password, mail.from, mail.to}),
              QStringList({"mail.lab.example", "a@b", "x^y", "kiosk@lab.example", "o'neil+orders@lab.example"}));
    EXPECT_EQ(mail.port, 2525);
    EXPECT_EQ(mail.encryption, MailEncryption::Tls);
    EXPECT_EQ(lab.programLetter, u'E');
    EXPECT_EQ(lab.driveOrder, u"ZD");
}

TEST(LabFileTest, TellsWhatIsWrongWithLineKeyAndWhatIsAllowed) {
    const struct {
        QByteArray file;
        QStringList told; // each stands in the one message
    } cases[] = {
        {"[Servers]\nHost = a\n", {"lab.ini:1:", "\"Servers\"", "[Server]", "[Drives]"}},
        {"[Server\nHost = a\n", {"lab.ini:1:", "\"Server\" lacks its closing bracket", "[Server]"}},
        {"[Server] # ours\nHost = a\n", {"lab.ini:1:", "behind the closing bracket of the section \"Server\""}},
        {"Host = a\n", {"lab.ini:1:", "before the first [section]"}},
        {"[Server]\nHots = a\n", {"lab.ini:2:", "\"Hots\"", "Host, User"}},
        {"[Server]\njust words\n", {"lab.ini:2:", "key = value"}},
        {"[Server]\nUser = a\nuser = b\n", {"lab.ini:3:", "Server.User", "line 2"}},
        {"[Server]\nFolder2 =\n", {"lab.ini:2:", "Server.Folder2", "not empty"}},
        {"[Server]\nFolder2 = a/b\n", {"Server.Folder2"}},
        {"[Server]\nFolder1 = ..\n", {"Server.Folder1"}},
        {"[Server]\nHost =\n", {"Server.Host", "host name"}},
        {"[Server]\nHost = a:70000\n", {"Server.Host", "65535"}},
        {"[Server]\nLines = 5\n", {"Server.Lines", "1 to 4"}},
        {"[Server]\nJppChunks = 0\n", {"Server.JppChunks", "1 to 32767"}},
        {"[Server]\nTls = yes\n", {"Server.Tls", "none, explicit or implicit"}},
        {"[Server]\nCa = ca.pem\n", {"Server.Ca", "beginning with /"}},
        {"[Client]\nLetter = Q\n", {"Client.Letter", "\"Q\"", "AS, B, C"}},
        {"[Client]\nCode = a/b\n", {"Client.Code"}},
        {"[Lab]\nPhone = \xE6\xBC\xA2\n", {"Lab.Phone", "Windows-1255"}},
        {"[Paper]\nSizes = 10/15, 00/13\n", {"Paper.Sizes", "two digits"}},
        {"[Paper]\nQuickSizes = 10/15,10/15,10/15,10/15\n", {"Paper.QuickSizes", "1 to 3"}},
        {"[Addresses]\nSite = http://a.example\n", {"Addresses.Site", "slash"}},
        {"[Addresses]\nReport = ftp://a.example/x\n", {"Addresses.Report", "http://"}},
        {"[Addresses]\nHttpHost = http://upload.example/\n", {"Addresses.HttpHost", "no slash"}},
        {"[Addresses]\nHttpTikiya = /orders\n", {"Addresses.HttpTikiya", "no slash"}},
        {"[Addresses]\nHttpScriptPath = /orders\n", {"Addresses.HttpScriptPath", "ends with a slash"}},
        {"[Addresses]\nHttpDone = http://upload.example/p.asp?t1=\n", {"Addresses.HttpDone", "without ?"}},
        {"[Switches]\nSender = mail\n", {"Switches.Sender", "ftp or http"}},
        {"[Switches]\nSender = http\n[Addresses]\nHttpTikiya = a\nHttpScriptPath = /\n",
         {"lab.ini:2:", "Switches.Sender", "Addresses.HttpHost is empty", "https:// in front and no slash"}},
        {"[Addresses]\nHttpHost = http://a\nHttpTikiya = a\n[Switches]\nSender = http\n",
         {"lab.ini:5:", "Addresses.HttpScriptPath is empty", "begins and ends with a slash"}},
        {"[Addresses]\nHttpHost = a\nHttpTikiya = a\nHttpScriptPath = /\n[Switches]\nSender = http\n",
         {"lab.ini:2:", "Addresses.HttpHost", "no slash"}},
        {"[Guards]\nCareful = yes\n[Switches]\nCoupon = yes\n",
         {"lab.ini:4:", "Switches.Coupon", "Paper.QuickSizes lacks 20/30"}},
        {"[Mail]\nServer = mail.example:25\nFrom = a@b\nTo = a@b\n", {"lab.ini:2:", "Mail.Server", "without a port"}},
        {"[Mail]\nPort = 0\n", {"Mail.Port", "1 to 65535"}},
        {"[Mail]\nTls = yes\n", {"Mail.Tls", "none, starttls or tls"}},
        {"[Mail]\nServer = m\nFrom = a@b\nTo = <a@b>\n", {"lab.ini:4:", "Mail.To"}},
        {"[Mail]\nServer = m\nFrom = a@b, c@d\nTo = a@b\n", {"lab.ini:3:", "Mail.From", "one bare mail address"}},
        {"[Mail]\nServer = m\nTo = a@b\n", {"lab.ini:2:", "Mail.From is empty"}},
        {"[Mail]\nFrom = a@b\nServer = m\nTo =\n", {"lab.ini:3:", "Mail.To is empty", "orders@lab.example"}},
        {"[Switches]\nReports = perhaps\n", {"Switches.Reports", "\"perhaps\"", "yes or no"}},
        {"[Kiosk]\nCode = 2468\n", {"Kiosk.Code", "lumora --kiosk-code"}},
        {"[Drives]\nOrder = EDE\n", {"Drives.Order", "once"}},
        {"[Drives]\nProgramLetter = Z\n", {"Drives.ProgramLetter"}},
        {"[Drives]\nDataFolder = here\n", {"Drives.DataFolder"}},
        {"[Branches]\nBranch11 = a\n", {"\"Branch11\""}},
        {"[Lab]\nName1 = \xFF\n", {"lab.ini:", "UTF-8"}},
        {QByteArray(2 << 20, '#'), {"lab.ini:", "1 MiB"}},
    };
    for (const auto& c : cases) {
        const QStringList errors = parse(c.file).errors;
        ASSERT_EQ(errors.size(), 1) << c.file.left(80).toStdString() << errors.join(u'\n').toStdString();
        for (const QString& text : c.told)
            EXPECT_TRUE(errors[0].contains(text)) << errors[0].toStdString() << "\nlacks " << text.toStdString();
    }
}

TEST(LabFileTest, TellsEveryFaultAtOnceAndNeverAPassword) {
    const QByteArray file =
        "[Server]\nPassword = secret^7\nUser = secret^7\nsecret7\nsecret-7 = 1\nHost = ftp://u:secret7@h\n"
        "Password = secret7\n[Mail]\nPassword = secret\x01\nServer = u:secret@m\nTo = secret\n";
    const QStringList errors = parse(file).errors;
    EXPECT_EQ(errors.size(), 9);
    EXPECT_FALSE(errors.join(u'\n').contains(u"secret")) << errors.join(u'\n').toStdString();
}

TEST(LabFileTest, TheExampleSaysWhatAKeyIsThatIsLeftOut) {
    const HostPath file = HostPath(LUMORA_SOURCE_DIR) / "packaging" / "lab.ini.example";
    QByteArray leftOut;
    QByteArray lines; // with the values that the comments name
    for (const QByteArray& line : readWholeFile(file, {}, 1 << 20)->split('\n')) {
        const qsizetype word = line.indexOf("Left out: ");
        if (line.startsWith('#') && word >= 0)
            leftOut = line.mid(word + 10, line.lastIndexOf('.') - word - 10);
        const bool names = !leftOut.isEmpty() && line.contains(" =") && !line.startsWith('#');
        if (!line.startsWith("PriceList"))
            lines += (names ? line.left(line.indexOf('=') + 1) + ' ' + leftOut : line) + '\n';
        if (!line.startsWith('#'))
            leftOut.clear();
    }
    const LabFileReading built = parse(lines);
    ASSERT_TRUE(built.errors.isEmpty()) << built.errors.join(u'\n').toStdString();
    EXPECT_TRUE(built.deployment == Deployment());

    SessionState session;
    LoadDefaultProfile(session, ReadLabFile(file).deployment);
    EXPECT_TRUE(session.Careful && !session.OperatorArea && !session.DegelEdit && session.transfer.keptFtpSession &&
                session.transfer.ftpLines == 3 && session.albumTail == AlbumTail::Photographer);
}

TEST(LabFileTest, WarnsOfAPasswordThatOthersCanRead) {
    QTemporaryDir folder;
    const QString name = folder.filePath(u"lab.ini"_s);
    const auto reading = [&](const QByteArray& content, QFile::Permissions rights) {
        EXPECT_TRUE(writeWholeFile(toHostPath(name), content) && QFile::setPermissions(name, rights));
        return ReadLabFile(toHostPath(name));
    };
    const QFile::Permissions mine = QFile::ReadOwner | QFile::WriteOwner;
    const QByteArray secret = "[Server]\nPassword = hush123\n";
    const QStringList warnings = reading(secret, mine | QFile::ReadOther).warnings;
    ASSERT_EQ(warnings.size(), 1);
    EXPECT_TRUE(warnings[0].contains(name) && warnings[0].contains(u"chmod 600"));
    EXPECT_FALSE(warnings[0].contains(u"hush123"));
    EXPECT_TRUE(reading(secret, mine).warnings.isEmpty());
    EXPECT_EQ(reading("[Mail]\npassword=hush\n", mine | QFile::ReadGroup).warnings.size(), 1);
    EXPECT_TRUE(reading("[Server]\nUser = u\n", mine | QFile::ReadOther).warnings.isEmpty());
}

TEST(LabFileTest, FindsTheFirstFileThatIsThereAndTellsOfOneItCannotRead) {
    QTemporaryDir folder;
    const HostPath base = toHostPath(folder.path());
    EXPECT_FALSE(FindLabFile({base / "a.ini", base / "b.ini"}));
    QFile second(folder.filePath(u"b.ini"_s));
    ASSERT_TRUE(second.open(QIODevice::WriteOnly));
    EXPECT_EQ(FindLabFile({base / "a.ini", base / "b.ini"}), base / "b.ini");
    EXPECT_EQ(ReadLabFile(base / "a.ini").errors.size(), 1);
    EXPECT_EQ(ReadLabFile(base).errors.size(), 1) << "a folder";
    EXPECT_EQ(labFilePlaces("/opt/lumora")[0], "/opt/lumora/lab.ini");
    EXPECT_EQ(labFilePlaces("/opt/lumora")[1], "/etc/lumora/lab.ini");
}

} // namespace
} // namespace lumora
