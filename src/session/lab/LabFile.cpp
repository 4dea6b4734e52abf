#include "session/lab/LabFile.h"

#include "common/AnsiCodePage.h"

#include <QFile>
#include <QFileInfo>
#include <QHash>
#include <QRegularExpression>
#include <QStringDecoder>

#include <functional>
#include <map>

// Read with Qt's own file class: the drives, which the rest of the program reads through, are what this file decides.

namespace lumora {

namespace {

constexpr qint64 largestFile = 1 << 20;

// True when the value is one that the key allows; then it stands in the deployment.
using Setter = std::function<bool(Deployment&, const QString&)>;

struct Key {
    QString section;
    QString name;
    QString allowed;
    Setter set;
};

bool matches(const QString& value, const char* pattern) {
    const QRegularExpression expression(QRegularExpression::anchoredPattern(QString::fromLatin1(pattern)));
    return expression.match(value).hasMatch();
}

Setter textOf(QString ClientProfile::*field, const char* pattern) {
    return [field, pattern](Deployment& deployment, const QString& value) {
        if (!matches(value, pattern))
            return false;
        deployment.profile.*field = value;
        return true;
    };
}

Setter hostOf(QString ClientProfile::*field) {
    return [field](Deployment& deployment, const QString& value) {
        static const QRegularExpression host(
            QStringLiteral("^(?:[A-Za-z0-9._-]+|\\[[0-9A-Fa-f:.]+\\])(?::([0-9]{1,5}))?$"));
        const QRegularExpressionMatch match = host.match(value);
        if (!match.hasMatch())
            return false;
        const int port = match.captured(1).toInt();
        if (match.hasCaptured(1) && (port < 1 || port > 65535))
            return false;
        deployment.profile.*field = value;
        return true;
    };
}

// A member of the deployment that a word sets.
template <class T>
Setter wordOf(T Deployment::*field, std::vector<std::pair<QString, T>> words) {
    return [field, words = std::move(words)](Deployment& deployment, const QString& value) {
        for (const auto& [word, meaning] : words) {
            if (value.compare(word, Qt::CaseInsensitive) == 0) {
                deployment.*field = meaning;
                return true;
            }
        }
        return false;
    };
}

template <class T>
Setter yesNo(T Deployment::*field, T yes, T no) {
    return wordOf<T>(field, {{QStringLiteral("yes"), yes},
                             {QStringLiteral("no"), no},
                             {QStringLiteral("1"), yes},
                             {QStringLiteral("0"), no}});
}

template <class T>
Setter numberOf(T ClientProfile::*field, int smallest, int largest) {
    return [=](Deployment& deployment, const QString& value) {
        if (!matches(value, "[0-9]{1,6}") || value.toInt() < smallest || value.toInt() > largest)
            return false;
        deployment.profile.*field = static_cast<T>(value.toInt());
        return true;
    };
}

template <std::size_t N>
Setter sizesOf(std::array<QString, N> ClientProfile::*field) {
    return [field](Deployment& deployment, const QString& value) {
        const QStringList given = value.split(u',');
        if (given.size() > static_cast<qsizetype>(N))
            return false;
        std::array<QString, N> sizes;
        for (std::size_t i = 0; i < static_cast<std::size_t>(given.size()); ++i) {
            sizes[i] = given[static_cast<qsizetype>(i)].trimmed();
            static const QRegularExpression size(QStringLiteral("^[0-9]{2}/[0-9]{2}$"));
            if (!size.match(sizes[i]).hasMatch() || sizes[i].startsWith(u"00") || sizes[i].endsWith(u"00"))
                return false;
        }
        deployment.profile.*field = sizes;
        return true;
    };
}

Setter shortText(std::function<QString&(ClientProfile&)> field) {
    return [field = std::move(field)](Deployment& deployment, const QString& value) {
        if (value.size() > 80)
            return false;
        field(deployment.profile) = value;
        return true;
    };
}

bool setDriveOrder(Deployment& deployment, const QString& value) {
    const QString letters = value.toUpper();
    for (int i = 0; i < letters.size(); ++i) {
        if (letters[i] < u'A' || letters[i] > u'Z' || letters.lastIndexOf(letters[i]) != i)
            return false;
    }
    deployment.driveOrder = letters;
    return true;
}

bool setProgramLetter(Deployment& deployment, const QString& value) {
    // Z: is the root of the file system.
    if (!matches(value, "[A-Ya-y]"))
        return false;
    deployment.programLetter = value.front().toUpper();
    return true;
}

bool setDataFolder(Deployment& deployment, const QString& value) {
    if (!value.isEmpty() && !value.startsWith(u'/'))
        return false;
    deployment.dataFolder = value;
    return true;
}

std::vector<Key> serverAndClientKeys() {
    const QString server = QStringLiteral("Server");
    const QString client = QStringLiteral("Client");
    const QString lab = QStringLiteral("Lab");
    const QString paper = QStringLiteral("Paper");
    const QString plain = QStringLiteral("up to 80 characters");
    using P = ClientProfile;
    return {
        {server, QStringLiteral("Host"), QStringLiteral("a host name or address, with :PORT (1 to 65535) if need be"),
         hostOf(&P::FtpServer)},
        // "^" parts the pieces of the settings text.
        {server, QStringLiteral("User"), QStringLiteral("1 to 80 characters, not ^"),
         textOf(&P::FtpUser, "[^^]{1,80}")},
        {server, QStringLiteral("Password"), QStringLiteral("up to 80 characters, not ^"),
         textOf(&P::FtpPassword, "[^^]{0,80}")},
        {server, QStringLiteral("Folder1"), QStringLiteral("one folder name without / \\ ^, or empty"),
         textOf(&P::FtpFolder1, "(?!\\.{1,2}$)[^^/\\\\]{0,80}")},
        {server, QStringLiteral("Folder2"), QStringLiteral("one folder name without / \\ ^, not empty"),
         textOf(&P::FtpFolder2, "(?!\\.{1,2}$)[^^/\\\\]{1,80}")},
        {server, QStringLiteral("JppChunks"), QStringLiteral("a whole number from 1 to 32767"),
         numberOf(&P::JppChunks, 1, 32767)},
        {server, QStringLiteral("JppBase"), QStringLiteral("a whole number from 0 to 32767"),
         numberOf(&P::JppBase, 0, 32767)},
        {server, QStringLiteral("JppTail"), QStringLiteral("40 or 60"),
         wordOf<std::int16_t>(&Deployment::SugTzad, {{QStringLiteral("40"), 40}, {QStringLiteral("60"), 60}})},
        {client, QStringLiteral("Code"), QStringLiteral("1 to 32 letters, digits, - and _"),
         textOf(&P::ClientCode, "[A-Za-z0-9_-]{1,32}")},
        {client, QStringLiteral("Letter"), QStringLiteral("AS, B, C, CL, AL, D or ALL"),
         textOf(&P::ClientLetter, "AS|B|C|CL|AL|D|ALL")},
        {lab, QStringLiteral("Name1"), plain, shortText([](P& p) -> QString& { return p.LabName1; })},
        {lab, QStringLiteral("Name2"), plain, shortText([](P& p) -> QString& { return p.LabName2; })},
        {lab, QStringLiteral("Mail"), plain, shortText([](P& p) -> QString& { return p.LabMail; })},
        {lab, QStringLiteral("Phone"), plain, shortText([](P& p) -> QString& { return p.LabPhone; })},
        {paper, QStringLiteral("Sizes"),
         QStringLiteral("1 to 15 sizes such as 10/15, two digits each, separated by commas"), sizesOf(&P::SizeList)},
        {paper, QStringLiteral("QuickSizes"),
         QStringLiteral("1 to 3 sizes such as 10/15, two digits each, separated by commas"), sizesOf(&P::QuickSizes)},
    };
}

std::vector<Key> addressAndSwitchKeys() {
    const QString addresses = QStringLiteral("Addresses");
    const QString switches = QStringLiteral("Switches");
    const QString yesOrNo = QStringLiteral("yes or no");
    const QString script = QStringLiteral("an address that begins with http://, without ? and #");
    using P = ClientProfile;
    using D = Deployment;
    using I = std::int16_t;
    return {
        {addresses, QStringLiteral("Site"),
         QStringLiteral("an address that begins with http:// or https:// and ends in a slash"),
         textOf(&P::SiteUrl, "https?://[^\\s/]+(/[^\\s]*)?/")},
        {addresses, QStringLiteral("PriceList"), QStringLiteral("an address that begins with http:// or https://"),
         textOf(&P::PriceListUrl, "https?://\\S+")},
        {addresses, QStringLiteral("Report"), script, textOf(&P::ReportUrl, "http://[^\\s?#/]+/[^\\s?#]+")},
        {addresses, QStringLiteral("Done"), script, textOf(&P::DoneUrl, "http://[^\\s?#/]+/[^\\s?#]+")},
        {addresses, QStringLiteral("HttpDone"), script, textOf(&P::HttpDoneUrl, "http://[^\\s?#/]+/[^\\s?#]+")},
        {addresses, QStringLiteral("HttpHost"),
         QStringLiteral("a host with http:// in front and no slash behind it, or empty"),
         textOf(&P::HttpHost, "(http://([A-Za-z0-9._-]+|\\[[0-9A-Fa-f:.]+\\])(:[0-9]{1,5})?)?")},
        {addresses, QStringLiteral("HttpTikiya"),
         QStringLiteral("folder names parted by /, with no slash at either end, or empty"),
         textOf(&P::HttpTikiya, "([^\\s?#/]+(/[^\\s?#/]+)*)?")},
        {addresses, QStringLiteral("HttpScriptPath"),
         QStringLiteral("a path that begins and ends with a slash, without ? and #, or empty"),
         textOf(&P::HttpScriptPath, "(/([^\\s?#/]+/)*)?")},
        {addresses, QStringLiteral("SettingsHost"),
         QStringLiteral("a host name or address, with :PORT (1 to 65535) if need be"), hostOf(&P::SettingsHost)},
        {switches, QStringLiteral("Reports"), yesOrNo,
         [](D& d, const QString& value) {
             D answer;
             if (!yesNo(&D::TachanaMekomit, true, false)(answer, value))
                 return false;
             d.profile.ReportOn = answer.TachanaMekomit ? 1 : 0;
             return true;
         }},
        {switches, QStringLiteral("Sender"), QStringLiteral("ftp or http"),
         wordOf<Sender>(&D::SugSheliach,
                        {{QStringLiteral("ftp"), Sender::Ftp}, {QStringLiteral("http"), Sender::Http}})},
        {switches, QStringLiteral("Coupon"), yesOrNo, yesNo<I>(&D::HaKoopon, 1, 0)},
        {switches, QStringLiteral("DeliveryQuestion"), yesOrNo, yesNo<I>(&D::DeliveryChoiceMode, 1, 0)},
        {switches, QStringLiteral("LocalStation"), yesOrNo, yesNo(&D::TachanaMekomit, true, false)},
        {switches, QStringLiteral("OptionalMail"), yesOrNo, yesNo(&D::DoarReshut, true, false)},
        {switches, QStringLiteral("DeepCompression"), QStringLiteral("ask or always"),
         wordOf<I>(&D::MediniyutDchisa, {{QStringLiteral("ask"), 1}, {QStringLiteral("always"), 2}})},
        {switches, QStringLiteral("BorderPage"), yesOrNo, yesNo<I>(&D::GvulMuzag, 1, 0)},
        {switches, QStringLiteral("FitPage"), yesOrNo, yesNo(&D::FitMuzag, true, false)},
        {switches, QStringLiteral("ExtraTile"), yesOrNo, yesNo<I>(&D::TmunatPaar, 1, 0)},
        {switches, QStringLiteral("QuickOrder"), yesOrNo, yesNo<I>(&D::MinuyPaar, 1, 2)},
        {switches, QStringLiteral("SplitPage"), yesOrNo, yesNo(&D::SplitPage, true, false)},
        {QStringLiteral("Drives"), QStringLiteral("ProgramLetter"), QStringLiteral("one letter from A to Y"),
         setProgramLetter},
        {QStringLiteral("Drives"), QStringLiteral("DataFolder"),
         QStringLiteral("the whole path of a folder, beginning with /, or empty"), setDataFolder},
        {QStringLiteral("Drives"), QStringLiteral("Order"), QStringLiteral("letters from A to Z, each once, or empty"),
         setDriveOrder},
    };
}

std::vector<Key> mailKeys() {
    const QString mail = QStringLiteral("Mail");
    const QString address = QStringLiteral("one bare mail address such as orders@lab.example, or empty");
    using D = Deployment;
    const auto text = [](QString MailAccount::*field, const char* pattern) -> Setter {
        return [field, pattern](D& d, const QString& value) {
            if (!matches(value, pattern))
                return false;
            d.profile.mail.*field = value;
            return true;
        };
    };
    const char* const bareAddress = "([A-Za-z0-9.!#$%&'*+/=?^_`{|}~-]{1,64}@[A-Za-z0-9.-]{1,190})?";
    return {
        {mail, QStringLiteral("Server"), QStringLiteral("a host name or address without a port, or empty"),
         text(&MailAccount::host, "([A-Za-z0-9._-]+|[0-9A-Fa-f:.]+)?")},
        {mail, QStringLiteral("Port"), QStringLiteral("a whole number from 1 to 65535, or empty"),
         [](D& d, const QString& value) {
             if (!matches(value, "[0-9]{0,5}") || value.toInt() > 65535 || (!value.isEmpty() && value.toInt() == 0))
                 return false;
             d.profile.mail.port = static_cast<quint16>(value.toInt());
             return true;
         }},
        {mail, QStringLiteral("User"), QStringLiteral("up to 80 characters"), text(&MailAccount::user, ".{0,80}")},
        {mail, QStringLiteral("Password"), QStringLiteral("up to 80 characters"),
         text(&MailAccount::password, ".{0,80}")},
        {mail, QStringLiteral("Tls"), QStringLiteral("none, starttls or tls"),
         [](D& d, const QString& value) {
             static const std::map<QString, MailEncryption> words = {
                 {QStringLiteral("none"), MailEncryption::None},
                 {QStringLiteral("starttls"), MailEncryption::StartTls},
                 {QStringLiteral("tls"), MailEncryption::Tls}};
             const auto word = words.find(value.toLower());
             if (word == words.end())
                 return false;
             d.profile.mail.encryption = word->second;
             return true;
         }},
        {mail, QStringLiteral("From"), address, text(&MailAccount::from, bareAddress)},
        {mail, QStringLiteral("To"), address, text(&MailAccount::to, bareAddress)},
    };
}

void addShopKeys(std::vector<Key>& keys) {
    using P = ClientProfile;
    const QString plain = QStringLiteral("up to 80 characters");
    const auto add = [&](const QString& section, const QString& name, std::function<QString&(P&)> field) {
        keys.push_back({section, name, plain, shortText(std::move(field))});
    };
    for (std::size_t i = 0; i < 2; ++i) {
        const QString name = QStringLiteral("Shop%1").arg(i + 1);
        const QString section = QStringLiteral("Shops");
        add(section, name, [i](P& p) -> QString& { return p.Shops[i].name; });
        add(section, name + QStringLiteral("Phone"), [i](P& p) -> QString& { return p.Shops[i].phone; });
    }
    for (std::size_t i = 0; i < 10; ++i) {
        const QString name = QStringLiteral("Branch%1").arg(i + 1);
        const QString section = QStringLiteral("Branches");
        add(section, name, [i](P& p) -> QString& { return p.Branches[i].caption; });
        add(section, name + QStringLiteral("Name"), [i](P& p) -> QString& { return p.Branches[i].name; });
        add(section, name + QStringLiteral("Address1"), [i](P& p) -> QString& { return p.Branches[i].address[0]; });
        add(section, name + QStringLiteral("Address2"), [i](P& p) -> QString& { return p.Branches[i].address[1]; });
        add(section, name + QStringLiteral("Phone"), [i](P& p) -> QString& { return p.Branches[i].phone; });
    }
}

std::vector<Key> allKeys() {
    std::vector<Key> keys = serverAndClientKeys();
    std::vector<Key> more = addressAndSwitchKeys();
    keys.insert(keys.end(), std::make_move_iterator(more.begin()), std::make_move_iterator(more.end()));
    const std::vector<Key> mail = mailKeys();
    keys.insert(keys.end(), mail.begin(), mail.end());
    addShopKeys(keys);
    return keys;
}

// What a message may repeat of a name in the file: a line that went wrong may hold anything, also a password.
QString shown(const QString& name) {
    return matches(name, "[A-Za-z][A-Za-z0-9]{0,30}") ? QStringLiteral("\"%1\"").arg(name)
                                                      : QStringLiteral("a name that is none");
}

class Parser {
public:
    explicit Parser(const QString& fileName)
        : m_fileName(fileName)
        , m_keys(allKeys()) {}

    LabFileReading take(const QString& text) {
        QString content = text;
        content.replace(QStringLiteral("\r\n"), QStringLiteral("\n"));
        for (const QString& line : content.split(u'\n')) {
            ++m_line;
            takeLine(line.trimmed());
        }
        checkTogether();
        return std::move(m_reading);
    }

private:
    void fail(const QString& what) {
        m_reading.errors += QStringLiteral("%1:%2: %3").arg(m_fileName).arg(m_line).arg(what);
    }

    // Each key by itself may be empty; with another that has been chosen it may not, or the first order would go
    // nowhere.
    void checkTogether() {
        const ClientProfile& profile = m_reading.deployment.profile;
        if (m_reading.deployment.SugSheliach == Sender::Http)
            checkFilled(QStringLiteral("Switches.Sender"), QStringLiteral("http"), QStringLiteral("Addresses"),
                        {{QStringLiteral("HttpHost"), profile.HttpHost},
                         {QStringLiteral("HttpTikiya"), profile.HttpTikiya},
                         {QStringLiteral("HttpScriptPath"), profile.HttpScriptPath}});
        if (profile.mail.setUp())
            checkFilled(QStringLiteral("Mail.Server"), QStringLiteral("given"), QStringLiteral("Mail"),
                        {{QStringLiteral("From"), profile.mail.from}, {QStringLiteral("To"), profile.mail.to}});
    }

    void checkFilled(const QString& chosen, const QString& as, const QString& section,
                     const std::vector<std::pair<QString, QString>>& needed) {
        m_line = m_seen.value(chosen);
        for (const auto& [name, value] : needed) {
            const QString fullName = section + u'.' + name;
            if (value.isEmpty() && m_reading.errors.filter(fullName).isEmpty()) // a wrong value is told already
                fail(QStringLiteral("%1 is %2, and %3 is empty; allowed with it: %4")
                         .arg(chosen, as, fullName,
                              QString(find(section, name)->allowed).remove(QStringLiteral(", or empty"))));
        }
    }

    void takeLine(const QString& line) {
        if (line.isEmpty() || line.startsWith(u'#') || line.startsWith(u';'))
            return;
        if (line.startsWith(u'[')) {
            takeSection(line);
            return;
        }
        const qsizetype equals = line.indexOf(u'=');
        if (equals < 0) {
            fail(QStringLiteral("neither a [section] nor \"key = value\" nor a comment that begins with #"));
            return;
        }
        takeValue(line.left(equals).trimmed(), line.mid(equals + 1).trimmed());
    }

    void takeSection(const QString& line) {
        const QString name = line.mid(1, line.size() - 2).trimmed();
        QStringList sections;
        for (const Key& key : m_keys) {
            if (!sections.contains(key.section))
                sections += key.section;
        }
        m_section.clear();
        m_sectionFailed = !line.endsWith(u']') || !sections.contains(name);
        if (m_sectionFailed)
            fail(QStringLiteral("the section %1 is not known; allowed: [%2]")
                     .arg(shown(name), sections.join(QStringLiteral("], ["))));
        else
            m_section = name;
    }

    void takeValue(const QString& name, QString value) {
        // One message is enough for a section that is not known.
        if (m_sectionFailed)
            return;
        if (m_section.isEmpty()) {
            fail(QStringLiteral("the key %1 stands before the first [section]").arg(shown(name)));
            return;
        }
        const Key* key = find(m_section, name);
        if (!key) {
            QStringList names;
            for (const Key& known : m_keys) {
                if (known.section == m_section)
                    names += known.name;
            }
            fail(QStringLiteral("the key %1 is not known in [%2]; allowed: %3")
                     .arg(shown(name), m_section, names.join(QStringLiteral(", "))));
            return;
        }
        const QString fullName = key->section + u'.' + key->name;
        if (const int earlier = m_seen.value(fullName)) {
            fail(QStringLiteral("%1 is given twice, first in line %2; allowed: once").arg(fullName).arg(earlier));
            return;
        }
        m_seen[fullName] = m_line;
        if (value.size() >= 2 && value.startsWith(u'"') && value.endsWith(u'"'))
            value = value.mid(1, value.size() - 2);
        if (!printable(value))
            fail(QStringLiteral("%1 holds a character that the lab's code page (Windows-1255) lacks, or a control "
                                "character; allowed: %2")
                     .arg(fullName, key->allowed));
        else if (!key->set(m_reading.deployment, value))
            fail(key->section == u"Server" || key->section == u"Mail" || value.size() > 80
                     ? QStringLiteral("%1 has a wrong value; allowed: %2").arg(fullName, key->allowed)
                     : QStringLiteral("%1 has the wrong value \"%2\"; allowed: %3").arg(fullName, value, key->allowed));
    }

    const Key* find(const QString& section, const QString& name) const {
        for (const Key& key : m_keys) {
            if (key.section == section && key.name.compare(name, Qt::CaseInsensitive) == 0)
                return &key;
        }
        return nullptr;
    }

    bool printable(const QString& value) const {
        // A host folder is never written in the code page.
        const bool hostName = m_section == u"Drives";
        for (const QChar letter : value) {
            if (letter.unicode() < 0x20 || letter.unicode() == 0x7F)
                return false;
        }
        return hostName || AnsiCodePage::squeeze(value) == value;
    }

    QString m_fileName;
    std::vector<Key> m_keys;
    LabFileReading m_reading;
    QString m_section;
    bool m_sectionFailed = false;
    int m_line = 0;
    QHash<QString, int> m_seen;
};

bool holdsPassword(const QByteArray& bytes) {
    static const QRegularExpression line(QStringLiteral("^\\s*password\\s*=\\s*\\S"),
                                         QRegularExpression::CaseInsensitiveOption |
                                             QRegularExpression::MultilineOption);
    return line.match(QString::fromUtf8(bytes)).hasMatch();
}

} // namespace

LabFileReading ParseLabFile(const QByteArray& bytes, const QString& fileName) {
    LabFileReading reading;
    if (bytes.size() > largestFile) {
        reading.errors += QStringLiteral("%1: the file is larger than 1 MiB").arg(fileName);
        return reading;
    }
    QStringDecoder decoder(QStringDecoder::Utf8);
    const QString text = decoder(bytes);
    if (decoder.hasError()) {
        reading.errors += QStringLiteral("%1: the file is not UTF-8 text; save it as UTF-8").arg(fileName);
        return reading;
    }
    return Parser(fileName).take(text);
}

LabFileReading ReadLabFile(const HostPath& file) {
    const QString name = toText(file);
    QFile opened(name);
    if (QFileInfo(name).isDir() || !opened.open(QIODevice::ReadOnly)) {
        LabFileReading reading;
        reading.errors +=
            QStringLiteral("%1: can't be read: %2")
                .arg(name, QFileInfo(name).isDir() ? QStringLiteral("it is a folder") : opened.errorString());
        return reading;
    }
    const QByteArray bytes = opened.read(largestFile + 1);
    LabFileReading reading = ParseLabFile(bytes, name);
    if (holdsPassword(bytes) && (opened.permissions() & (QFile::ReadGroup | QFile::ReadOther)) != QFile::Permissions())
        reading.warnings +=
            QStringLiteral(
                "%1: others on this machine can read the password of a server; set the rights with: chmod 600 %1")
                .arg(name);
    return reading;
}

std::vector<HostPath> labFilePlaces(const HostPath& programFolder) {
    const QByteArray config = qgetenv("XDG_CONFIG_HOME");
    // The base folder counts only when it is a whole path.
    const HostPath configFolder =
        config.startsWith('/') ? HostPath(config.toStdString()) : HostPath(qgetenv("HOME").toStdString()) / ".config";
    return {programFolder / "lab.ini", "/etc/lumora/lab.ini", configFolder / "lumora" / "lab.ini"};
}

std::optional<HostPath> FindLabFile(const std::vector<HostPath>& places) {
    for (const HostPath& place : places) {
        std::error_code unimportant;
        if (std::filesystem::exists(place, unimportant))
            return place;
    }
    return std::nullopt;
}

} // namespace lumora
