#include "session/lab/LabKeys.h"

#include <QRegularExpression>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using D = Deployment;
using P = ClientProfile;
using I = std::int16_t;

// --- where a value goes ---

template <class T>
auto at(T D::*field) {
    return [field](D& d) -> T& { return d.*field; };
}

template <class T>
auto at(T P::*field) {
    return [field](D& d) -> T& { return d.profile.*field; };
}

auto at(bool DoorRules::*field) {
    return [field](D& d) -> bool& { return d.door.*field; };
}

template <class T>
auto at(T KioskRules::*field) {
    return [field](D& d) -> T& { return d.kiosk.*field; };
}

auto at(QString LabTexts::*field) {
    return [field](D& d) -> QString& { return d.texts.*field; };
}

template <class T>
auto at(T LineEncryption::*field) {
    return [field](D& d) -> T& { return d.encryption.*field; };
}

template <class T>
auto at(T MailAccount::*field) {
    return [field](D& d) -> T& { return d.profile.mail.*field; };
}

// --- the kinds of value, each with what it allows ---

struct Kind {
    QString allowed;
    std::function<bool(D&, const QString&)> set;
    bool ofMachine = false;
};

bool matches(const QString& value, const QString& pattern) {
    return QRegularExpression(QRegularExpression::anchoredPattern(pattern)).match(value).hasMatch();
}

template <class Where>
Kind text(Where where, const QString& allowed, const QString& pattern) {
    return {allowed, [where, pattern](D& d, const QString& value) {
                if (!matches(value, pattern))
                    return false;
                where(d) = value;
                return true;
            }};
}

template <class Where>
Kind shortText(Where where) {
    return text(where, u"up to 80 characters"_s, u"(?s).{0,80}"_s);
}

// what: "file" or "folder".
template <class Where>
Kind pathOf(const QString& what, Where where) {
    Kind kind = text(where, u"the whole path of a %1, beginning with /, or empty"_s.arg(what), u"(?s)(/.*)?"_s);
    kind.ofMachine = true;
    return kind;
}

template <class Where>
Kind script(Where where) {
    return text(where, u"an address that begins with http:// or https://, without ? and #"_s,
                u"https?://[^\\s?#/]+/[^\\s?#]+"_s);
}

template <class Where>
Kind mailAddress(Where where) {
    return text(where, u"one bare mail address such as orders@lab.example, or empty"_s,
                u"([A-Za-z0-9.!#$%&'*+/=?^_`{|}~-]{1,64}@[A-Za-z0-9.-]{1,190})?"_s);
}

Kind host(QString P::*field) {
    return {u"a host name or address, with :PORT (1 to 65535) if need be"_s, [field](D& d, const QString& value) {
                static const QRegularExpression form(u"^(?:[A-Za-z0-9._-]+|\\[[0-9A-Fa-f:.]+\\])(?::([0-9]{1,5}))?$"_s);
                const QRegularExpressionMatch match = form.match(value);
                const int port = match.captured(1).toInt();
                if (!match.hasMatch() || (match.hasCaptured(1) && (port < 1 || port > 65535)))
                    return false;
                d.profile.*field = value;
                return true;
            }};
}

template <class Where>
Kind number(Where where, int smallest, int largest) {
    return {u"a whole number from %1 to %2"_s.arg(smallest).arg(largest), [=](D& d, const QString& value) {
                if (!matches(value, u"[0-9]{1,6}"_s) || value.toInt() < smallest || value.toInt() > largest)
                    return false;
                auto& field = where(d);
                field = static_cast<std::remove_reference_t<decltype(field)>>(value.toInt());
                return true;
            }};
}

bool setMailPort(D& d, const QString& value) {
    if (!matches(value, u"[0-9]{0,5}"_s) || value.toInt() > 65535 || (!value.isEmpty() && value.toInt() == 0))
        return false;
    d.profile.mail.port = static_cast<quint16>(value.toInt());
    return true;
}

template <class T>
struct Word {
    QString word;
    T meaning;
};

template <class T, class Where>
Kind words(Where where, const QString& allowed, std::vector<Word<T>> words) {
    return {allowed, [where, words = std::move(words)](D& d, const QString& value) {
                for (const Word<T>& known : words) {
                    if (value.compare(known.word, Qt::CaseInsensitive) == 0) {
                        where(d) = known.meaning;
                        return true;
                    }
                }
                return false;
            }};
}

template <class T, class Where>
Kind yesNo(Where where, T yes, T no) {
    return words<T>(where, u"yes or no"_s, {{u"yes"_s, yes}, {u"no"_s, no}, {u"1"_s, yes}, {u"0"_s, no}});
}

template <std::size_t N>
Kind sizes(std::array<QString, N> P::*field) {
    return {u"1 to %1 sizes such as 10/15, two digits each, separated by commas"_s.arg(N),
            [field](D& d, const QString& value) {
                const QStringList given = value.split(u',');
                if (given.size() > static_cast<qsizetype>(N))
                    return false;
                std::array<QString, N> taken;
                for (std::size_t i = 0; i < static_cast<std::size_t>(given.size()); ++i) {
                    taken[i] = given[static_cast<qsizetype>(i)].trimmed();
                    if (!matches(taken[i], u"(?!00)[0-9]{2}/(?!00)[0-9]{2}"_s))
                        return false;
                }
                d.profile.*field = taken;
                return true;
            }};
}

bool setDriveOrder(D& d, const QString& value) {
    const QString letters = value.toUpper();
    for (int i = 0; i < letters.size(); ++i) {
        if (letters[i] < u'A' || letters[i] > u'Z' || letters.lastIndexOf(letters[i]) != i)
            return false;
    }
    d.driveOrder = letters;
    return true;
}

bool setProgramLetter(D& d, const QString& value) {
    // Z: is the root of the file system.
    if (!matches(value, u"[A-Ya-y]"_s))
        return false;
    d.programLetter = value.front().toUpper();
    return true;
}

// --- the table ---

struct Row {
    const char* section;
    const char* name;
    Kind kind;
};

std::vector<Row> rows() {
    // "^" separates the pieces of the settings text.
    return {
        {"Server", "Host", host(&P::FtpServer)},
        {"Server", "User", text(at(&P::FtpUser), u"1 to 80 characters, not ^"_s, u"[^^]{1,80}"_s)},
        {"Server", "Password", text(at(&P::FtpPassword), u"up to 80 characters, not ^"_s, u"[^^]{0,80}"_s)},
        {"Server", "Folder1",
         text(at(&P::FtpFolder1), u"one folder name without / \\ ^, or empty"_s, u"(?!\\.{1,2}$)[^^/\\\\]{0,80}"_s)},
        {"Server", "Folder2",
         text(at(&P::FtpFolder2), u"one folder name without / \\ ^, not empty"_s, u"(?!\\.{1,2}$)[^^/\\\\]{1,80}"_s)},
        {"Server", "Type",
         words<FtpType>(at(&D::ftpType), u"A or I"_s, {{u"A"_s, FtpType::Ascii}, {u"I"_s, FtpType::Image}})},
        {"Server", "Tls",
         words<FtpTls>(
             at(&LineEncryption::ftp), u"none, explicit or implicit"_s,
             {{u"none"_s, FtpTls::None}, {u"explicit"_s, FtpTls::Explicit}, {u"implicit"_s, FtpTls::Implicit}})},
        {"Server", "Ca", pathOf(u"file"_s, at(&LineEncryption::authorities))},
        {"Server", "Session",
         words<bool>(at(&D::keptFtpSession), u"each or kept"_s, {{u"each"_s, false}, {u"kept"_s, true}})},
        {"Server", "Lines", number(at(&D::ftpLines), 1, 4)},
        {"Server", "JppChunks", number(at(&P::JppChunks), 1, 32767)},
        {"Server", "JppBase", number(at(&P::JppBase), 0, 32767)},
        {"Server", "JppTail", words<I>(at(&D::SugTzad), u"40 or 60"_s, {{u"40"_s, 40}, {u"60"_s, 60}})},

        {"Client", "Code", text(at(&P::ClientCode), u"1 to 32 letters, digits, - and _"_s, u"[A-Za-z0-9_-]{1,32}"_s)},
        {"Client", "Letter", text(at(&P::ClientLetter), u"AS, B, C, CL, AL, D or ALL"_s, u"AS|B|C|CL|AL|D|ALL"_s)},

        {"Lab", "Name1", shortText(at(&P::LabName1))},
        {"Lab", "Name2", shortText(at(&P::LabName2))},
        {"Lab", "Mail", shortText(at(&P::LabMail))},
        {"Lab", "Phone", shortText(at(&P::LabPhone))},

        {"Paper", "Sizes", sizes(&P::SizeList)},
        {"Paper", "QuickSizes", sizes(&P::QuickSizes)},

        {"Album", "Tail",
         words<AlbumTail>(at(&D::albumTail), u"customer or photographer"_s,
                          {{u"customer"_s, AlbumTail::Customer}, {u"photographer"_s, AlbumTail::Photographer}})},

        {"Addresses", "Site",
         text(at(&P::SiteUrl), u"an address that begins with http:// or https:// and ends in a slash"_s,
              u"https?://[^\\s/]+(/[^\\s]*)?/"_s)},
        {"Addresses", "PriceList",
         text(at(&P::PriceListUrl), u"an address that begins with http:// or https://"_s, u"https?://\\S+"_s)},
        {"Addresses", "Report", script(at(&P::ReportUrl))},
        {"Addresses", "Done", script(at(&P::DoneUrl))},
        {"Addresses", "HttpDone", script(at(&P::HttpDoneUrl))},
        {"Addresses", "HttpHost",
         text(at(&P::HttpHost), u"a host with http:// or https:// in front and no slash behind it, or empty"_s,
              u"(https?://([A-Za-z0-9._-]+|\\[[0-9A-Fa-f:.]+\\])(:[0-9]{1,5})?)?"_s)},
        {"Addresses", "HttpTikiya",
         text(at(&P::HttpTikiya), u"folder names parted by /, with no slash at either end, or empty"_s,
              u"([^\\s?#/]+(/[^\\s?#/]+)*)?"_s)},
        {"Addresses", "HttpScriptPath",
         text(at(&P::HttpScriptPath), u"a path that begins and ends with a slash, without ? and #, or empty"_s,
              u"(/([^\\s?#/]+/)*)?"_s)},
        {"Addresses", "SettingsHost", host(&P::SettingsHost)},

        {"Switches", "Reports", yesNo<I>(at(&P::ReportOn), 1, 0)},
        {"Switches", "Sender",
         words<Sender>(at(&D::SugSheliach), u"ftp or http"_s, {{u"ftp"_s, Sender::Ftp}, {u"http"_s, Sender::Http}})},
        {"Switches", "Coupon", yesNo<I>(at(&D::HaKoopon), 1, 0)},
        {"Switches", "DeliveryQuestion", yesNo<I>(at(&D::DeliveryChoiceMode), 1, 0)},
        {"Switches", "LocalStation", yesNo(at(&D::TachanaMekomit), true, false)},
        {"Switches", "OptionalMail", yesNo(at(&D::DoarReshut), true, false)},
        {"Switches", "DeepCompression",
         words<I>(at(&D::MediniyutDchisa), u"ask or always"_s, {{u"ask"_s, 1}, {u"always"_s, 2}})},
        {"Switches", "DeepCompressionAlbum", yesNo(at(&D::DchisatAlbum), true, false)},
        {"Switches", "BorderPage", yesNo<I>(at(&D::GvulMuzag), 1, 0)},
        {"Switches", "FitPage", yesNo(at(&D::FitMuzag), true, false)},
        {"Switches", "ExtraTile", yesNo<I>(at(&D::TmunatPaar), 1, 0)},
        {"Switches", "QuickOrder", yesNo<I>(at(&D::MinuyPaar), 1, 2)},
        {"Switches", "SplitPage", yesNo(at(&D::SplitPage), true, false)},

        {"Texts", "Terms", pathOf(u"file"_s, at(&LabTexts::terms))},
        {"Texts", "PriceList", pathOf(u"file"_s, at(&LabTexts::priceList))},
        {"Texts", "Help", pathOf(u"file"_s, at(&LabTexts::help))},

        {"Guards", "Careful", yesNo(at(&D::Careful), true, false)},

        {"Door", "Formats",
         words<bool>(at(&DoorRules::everyFormat), u"jpg or all"_s, {{u"jpg"_s, false}, {u"all"_s, true}})},
        {"Door", "Upright", yesNo(at(&DoorRules::upright), true, false)},
        {"Door", "Colour",
         words<bool>(at(&DoorRules::srgb), u"stored or sRGB"_s, {{u"stored"_s, false}, {u"sRGB"_s, true}})},
        {"Door", "Cards",
         words<bool>(at(&D::watchedCards), u"stored or watched"_s, {{u"stored"_s, false}, {u"watched"_s, true}})},

        {"Operator", "Area", yesNo(at(&D::OperatorArea), true, false)},
        {"Operator", "Editor", yesNo(at(&D::OperatorEditor), true, false)},

        {"Look", "Contrast", yesNo(at(&D::contrast), true, false)},

        {"Kiosk", "Waiting", yesNo(at(&D::Waiting), true, false)},
        {"Kiosk", "Keyboard",
         words<ScreenKeys>(
             at(&D::screenKeys), u"never, auto or always"_s,
             {{u"never"_s, ScreenKeys::Never}, {u"auto"_s, ScreenKeys::Touches}, {u"always"_s, ScreenKeys::Always}})},
        {"Kiosk", "Mode", yesNo(at(&KioskRules::on), true, false)},
        {"Kiosk", "IdleSeconds", number(at(&KioskRules::idleSeconds), 10, 3600)},
        {"Kiosk", "Code",
         text(at(&KioskRules::code), u"what \"lumora --kiosk-code\" prints, or empty"_s,
              u"([0-9]{5,7}:[0-9a-f]{32}:[0-9a-f]{64})?"_s)},
        {"Kiosk", "Printer",
         text(at(&KioskRules::printer),
              u"the name of a print queue, up to 127 characters without / # and blanks, or empty"_s,
              u"([^\\s/#-][^\\s/#]{0,126})?"_s)},
        {"Kiosk", "KeepDays", number(at(&KioskRules::keepDays), 1, 9999)},
        {"Kiosk", "KeepLogDays", number(at(&KioskRules::keepLogDays), 1, 9999)},

        {"Log", "Keep", yesNo(at(&D::KeepLog), true, false)},

        {"Drives", "ProgramLetter", {u"one letter from A to Y"_s, setProgramLetter}},
        {"Drives", "DataFolder", pathOf(u"folder"_s, at(&D::dataFolder))},
        {"Drives", "Order", {u"letters from A to Z, each once, or empty"_s, setDriveOrder}},

        {"Mail", "Server",
         text(at(&MailAccount::host), u"a host name or address without a port, or empty"_s,
              u"([A-Za-z0-9._-]+|[0-9A-Fa-f:.]+)?"_s)},
        {"Mail", "Port", {u"a whole number from 1 to 65535, or empty"_s, setMailPort}},
        {"Mail", "User", shortText(at(&MailAccount::user))},
        {"Mail", "Password", shortText(at(&MailAccount::password))},
        {"Mail", "Tls",
         words<MailEncryption>(at(&MailAccount::encryption), u"none, starttls or tls"_s,
                               {{u"none"_s, MailEncryption::None},
                                {u"starttls"_s, MailEncryption::StartTls},
                                {u"tls"_s, MailEncryption::Tls}})},
        {"Mail", "From", mailAddress(at(&MailAccount::from))},
        {"Mail", "To", mailAddress(at(&MailAccount::to))},
    };
}

// The two shops and the ten branches, each with a number in its keys' names.
void addPlaces(std::vector<LabKey>& keys) {
    const auto add = [&](const QString& section, const QString& name, auto where) {
        Kind kind = shortText(where);
        keys.push_back({section, name, std::move(kind.allowed), std::move(kind.set)});
    };
    for (std::size_t i = 0; i < 2; ++i) {
        const auto of = [i](QString Shop::*field) {
            return [i, field](D& d) -> QString& { return d.profile.Shops[i].*field; };
        };
        const QString name = u"Shop%1"_s.arg(i + 1);
        add(u"Shops"_s, name, of(&Shop::name));
        add(u"Shops"_s, name + u"Phone"_s, of(&Shop::phone));
    }
    for (std::size_t i = 0; i < 10; ++i) {
        const auto of = [i](QString Branch::*field) {
            return [i, field](D& d) -> QString& { return d.profile.Branches[i].*field; };
        };
        const auto address = [i](std::size_t line) {
            return [i, line](D& d) -> QString& { return d.profile.Branches[i].address[line]; };
        };
        const QString name = u"Branch%1"_s.arg(i + 1);
        add(u"Branches"_s, name, of(&Branch::caption));
        add(u"Branches"_s, name + u"Name"_s, of(&Branch::name));
        add(u"Branches"_s, name + u"Address1"_s, address(0));
        add(u"Branches"_s, name + u"Address2"_s, address(1));
        add(u"Branches"_s, name + u"Phone"_s, of(&Branch::phone));
    }
}

} // namespace

const std::vector<LabKey>& labKeys() {
    static const std::vector<LabKey> keys = [] {
        std::vector<LabKey> made;
        for (const Row& row : rows())
            made.push_back({QLatin1StringView(row.section), QLatin1StringView(row.name), row.kind.allowed, row.kind.set,
                            row.kind.ofMachine});
        addPlaces(made);
        return made;
    }();
    return keys;
}

} // namespace lumora
