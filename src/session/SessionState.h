#pragma once

#include "common/DoorRules.h"
#include "common/DrivePath.h"
#include "common/KioskRules.h"
#include "common/LabTexts.h"
#include "platform/line/Mail.h"

#include <QDateTime>
#include <QString>
#include <QStringList>

#include <array>
#include <cstdint>
#include <optional>

// The state of one run, read by every page. Names are those of the lab's own records; docs/glossary.md tells each in
// English.
namespace lumora {

// A shop of the delivery question on the start page.
struct Shop {
    QString name;
    QString phone;
    bool operator==(const Shop&) const = default;
};

// A branch at which a coupon order is fetched: the button's caption and what its card says.
struct Branch {
    QString caption;
    QString name;
    std::array<QString, 2> address; // up to two lines
    QString phone;
    bool operator==(const Branch&) const = default;
};

// The client profile: which lab this copy serves. Set by LoadDefaultProfile from the built-in values and the
// deployment.
struct ClientProfile {
    QString FtpFolder1; // first remote folder level, empty when there is none
    QString FtpFolder2; // second remote folder level
    QString ClientCode; // short code of the client, key of the reports
    QString FtpServer;  // host, with an optional port
    QString FtpPassword;
    QString FtpUser;
    QString ServerKey;                 // carried by the settings text only
    std::int16_t JppBase = 0;          // added to the piece length in a print file
    std::int32_t JppChunks = 0;        // pieces of a print file
    std::int32_t ProfileNumber = 0;    // carried by the settings text only
    std::array<QString, 15> SizeList;  // paper sizes on offer, "10/15"; empty entries are skipped
    std::array<QString, 3> QuickSizes; // the sizes placed in front
    QString ClientLetter;              // client kind: decides the tiles of the menu
    QString LabName1;
    QString LabName2;
    QString LabMail;
    QString LabPhone;
    QString SiteUrl; // ends in a slash
    QString PriceListUrl;
    QString PriceListUrl2;
    QString ReportUrl;      // whole address of the report script
    QString DoneUrl;        // whole address of the done script, FTP sender
    QString HttpDoneUrl;    // the same for the HTTP sender, on a host of its own
    QString HttpHost;       // web server of the HTTP sender, with its scheme and without a final slash; empty: none
    QString HttpTikiya;     // site folder with its listing scripts and "uploads"
    QString HttpScriptPath; // path of its upload scripts, begins and ends with a slash
    QString SettingsHost;   // host of the remote settings texts
    QString AdUrl1;
    QString AdUrl2;
    DrivePath AdFile1;
    DrivePath AdFile2;
    std::int16_t ReportOn = 0;       // above 0: the reports are sent
    MailAccount mail;                // finished orders go through it; not set up: no mail step
    std::array<Shop, 2> Shops;       // rows of the delivery question
    std::array<Branch, 11> Branches; // ten shops, then home delivery
    bool operator==(const ClientProfile&) const = default;
};

// The details of one order.
struct OrderDetails {
    QString n1; // customer's first and last name
    QString n2; // telephone
    QString n3; // delivery address
    QString n4; // spare, printed behind the telephone
    QString Mail;
    QString FillFit;             // "FIT", "FIL", "NNN" not chosen, "FFF" album
    QString Hearot;              // remarks
    std::optional<QDateTime> T1; // spare date
    QString Bord;                // border code
    QString ppr;                 // paper size, "10/15"; "***" until chosen; "zz/zz" mixed
    QString maat;                // paper kind as the page's language has it; "***" until chosen
    QString ser;                 // last four characters of the volume serial
    std::int16_t TotalPics = 0;  // copies in all
    QString Soog1;               // a mixed-size order's two kinds
    QString Soog2;
    QString CustomCode; // size code of a special size, four characters; nothing sets it
    QString TimeOfJob;  // YYYY_MM_DD_SSS_ssss^
    QString Girsa;      // version of the record
};

// A parent album order.
struct AlbumDetails {
    QString ShemZalam;               // photographer's name
    QString ShemErooa;               // name of the event
    QString TelZalam;                // photographer's telephone
    QString MailZalam;               // photographer's mail address
    QString SoogLBM;                 // album kind
    QString SoogKricha;              // cover
    QString SoogNiar;                // paper
    std::array<QString, 5> Tosafot1; // extras
    std::array<QString, 9> Tosafot2; // special extras
    QString GodelLBM;                // album size
    QString HearotLBM;               // spare remark
    QString KamutHorim;              // copies of the parent album
    QString SoogHorim;               // size of the parent album
};

// An order paid by a coupon of a fixed quantity.
struct CouponState {
    std::int16_t HaKoopon = 0;     // 1: the quantity is checked
    std::int16_t MisparKoopon = 0; // pictures the coupon holds; with Careful 0 for a size without a coupon
    std::int16_t SmallCount = 0;   // quantities of the two sizes of the product
    std::int16_t LargeCount = 0;
};

// The picture last opened in the editor: the raw record, 200 characters, and its fields.
struct EditFields {
    QString EditState;
    DrivePath PicturePath;
    QString TempRedName;
    float GainR = 1;
    float GainG = 1;
    float GainB = 1;
    std::int16_t RotationCode = 180;
    std::int16_t ZoomPercent = 100;
    std::int16_t PanX = 999;
    std::int16_t PanY = 999;
    std::int16_t ToneFlag = 0;
    std::int16_t SpareFlag = 0;
    QString FrameName;
    QString LineFrameCode;
    QString RedMarker;
    QString AutoMarker;
    QString FrameFolder;
    std::int16_t TextFontSize = 8;
    std::int16_t TextAlign = 0;
    std::int16_t TextOn = 0;
    QString Tag;
    std::int16_t TextBlue = 0;
    std::int16_t TextGreen = 0;
    std::int16_t TextRed = 0;
    std::int16_t TextX = 0;
    std::int16_t TextY = 0;
    std::int16_t TextVertical = 0;
    std::int16_t TextStyle = 0;
    QString TextFont;
    QString TextBody;
};

// The kind of an order, under the numbers that the order log, the print files and their names carry.
enum class OrderKind : std::int16_t {
    NotChosen = 0,
    Print = 1,
    EditedPrint = 2,
    Sequence = 3, // printed in one sequence
    Mail = 4,
    Restart = 7,
    Other = 9,
    Album = 10,
};

// True for an order whose pictures are printed as they are.
constexpr bool printsAsTheyAre(OrderKind kind) {
    return kind == OrderKind::Print || kind == OrderKind::Sequence || kind == OrderKind::Album;
}

enum class Sender : std::int16_t { Ftp = 0, Http = 1 };

// Whose name and telephone the tail of an album's print files carries.
enum class AlbumTail : std::int16_t { Customer, Photographer };

// For which presses of a field the keyboard on the screen rises.
enum class ScreenKeys : std::int16_t { Never, Touches, Always };

enum class Sending : std::int16_t { NewOrder = 0, Resend = 1, Chain = 2 };

// In which form the files of an order travel.
enum class Travel : std::int16_t { Whole = 0, Pieces = 1 };

// A chosen picture that is not in the order that was prepared, and why.
struct LeftOut {
    enum class Why : std::int16_t { NoJpeg, Name, Gone, Damaged, NotWritten, NotTold };
    DrivePath picture;
    Why why = Why::Damaged;
};

// What the senders share.
struct TransferState {
    DrivePath OrderFolder;     // of the order that is being prepared, sent or looked at
    DrivePath OrderLogBase;    // path of the order log without ".txt"
    QString ShemTikiya;        // leaf name of the order folder, also its name on the server
    std::int16_t HazmanaP = 0; // above 0: the folder's name ends in "P"
    Sender SugSheliach = Sender::Ftp;
    Sending SugMishloah = Sending::NewOrder;
    Travel Mefurak = Travel::Whole;
    bool keptFtpSession = false;     // one FTP session a pass; else one a file
    int ftpLines = 1;                // with a kept session: connections that files go by at once
    std::int16_t KeSherLaSharat = 0; // three values that the order log carries and nothing sets
    QString HitKasherDerech;
    std::int16_t TaooyotBaHaShvaa = 0;
    std::int16_t MailFlag = 0; // cleared at the start of each order
    QList<LeftOut> leftOut;    // of the order that is being prepared or sent
    bool leftOutAsked = false; // the customer goes on without them
};

// The closing panel of the page of pictures as the customer left it.
struct ClosingEntries {
    QString Text1;            // mail address, before the "@"
    QString Combo1;           // behind it
    int Combo1Index = -1;     // row of the list; -1: typed
    bool promptStands = true; // Combo1 shows its prompt
    QString Text2;            // note
};

// An order that stays at the station, for the line that the start page has for the customer. Its facts and not the
// line: the start page opens in its own language and may turn.
struct KeptOrder {
    QString number; // empty: there is none
    qsizetype leftOut = 0;
};

// The lines that one page copies into a list of the next, and what it asks the next page to do with them.
struct HandOver {
    QStringList lines;
    bool pressStart = false; // the next page starts its work by itself once it is shown
    KeptOrder kept;
    DrivePath takenUp;      // folder of the order that goes on from another run; empty for a new order
    DrivePath replaced;     // folder of the order that the next one is prepared again from
    int renumbered = 0;     // times in a row that this was done
    QStringList basket;     // the lines that the page of pictures handed over, for the way back to it
    QStringList pictures;   // all pictures that it offered
    ClosingEntries closing; // what was typed there
    OrderDetails details;   // of the order, without mail address and note
    DrivePath doorFolder;   // where its pictures were made that are no ordinary JPEG files
    bool back = false;      // it takes all of them back
};

struct SessionState {
    DrivePath DiskRoot; // "C:\", root of all workspace paths
    OrderKind Optint = OrderKind::NotChosen;
    QString MisparHazmana = QStringLiteral("100"); // number of the order being built
    QString KodMishloach = QStringLiteral("   ");  // how the order started, three characters
    QString KodMishloachMakor = QStringLiteral("   ");
    bool MishloachHabaita = false;       // home delivery: the address is required
    std::int16_t EnglishTips = 0;        // 0 Hebrew, 1 English
    bool TachanaMekomit = false;         // local station: the order stays in the workspace
    bool DoarReshut = false;             // the e-mail address is optional
    std::int16_t MediniyutDchisa = 2;    // deep compression of large prints: 1 ask, 2 always
    bool DchisatAlbum = true;            // deep compression is for albums too
    std::int16_t DchisaAmoka = 0;        // 1: deep compression is on for this order
    std::int16_t SugTzad = 40;           // length of the tail of a print file, 40 or 60
    QString BranchChoice;                // caption of the collection point
    std::int16_t DeliveryChoiceMode = 0; // 1: the start page asks where the prints are fetched
    bool FitMuzag = false;               // the fit or fill page is shown
    std::int16_t GvulMuzag = 1;          // 1: the border page is shown
    bool DegelEdit = false;              // shows the editor's spare panel
    std::int16_t MinuyPaar = 1;          // 2: changes the menu
    std::int16_t TmunatPaar = 0;         // 1: adds a menu tile and a step behind preparation
    bool SplitPage = false;              // the finished orders lead to the pieces, an operator's tool
    bool ModulRezef = false;             // the order is picked in one sequence, kinds 3 and 10
    bool Careful = false;                // the guards of docs/guards.md are on
    DoorRules door;                      // what is let through of the pictures that customers bring
    AlbumTail albumTail = AlbumTail::Customer;
    bool offerPutOff = false; // the customer has put off the unfinished orders for this run
    bool OperatorArea = true; // a customer may open the hidden area of the sending page
    bool Waiting = false;     // orders that did not arrive are sent by themselves while nobody is at the start page
    ScreenKeys screenKeys = ScreenKeys::Never;
    int waitingOrders = 0; // how many there are, as the start page counted them last
    QString slipTrouble;   // why the last slip was not printed, in the machine's words; for the staff
    KioskRules kiosk;
    LabTexts texts;
    bool staff = false; // on a kiosk: the staff has given its code

    ClientProfile profile;
    OrderDetails shemot;
    AlbumDetails album;
    CouponState coupon;
    EditFields edit;
    TransferState transfer;
    HandOver handOver;
    DrivePath keptFolder; // where copies of the order's pictures lie that were chosen from cards (order/KeptPictures.h)

    // Customers use the machine one after another, and what is meant for the staff is closed.
    bool closedToCustomers() const { return kiosk.on && !staff; }
    bool mayOpenOperatorArea() const { return kiosk.on ? staff : OperatorArea; }
    bool english() const { return EnglishTips == 1; }
    // The wording in the language of the session.
    QString wording(const QString& hebrew, const QString& inEnglish) const { return english() ? inEnglish : hebrew; }
    QString wording(const char16_t* hebrew, const char16_t* inEnglish) const {
        return QString::fromUtf16(english() ? inEnglish : hebrew);
    }
};

} // namespace lumora
