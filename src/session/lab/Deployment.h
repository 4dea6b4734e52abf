#pragma once

#include "common/DoorRules.h"
#include "common/KioskRules.h"
#include "common/LabTexts.h"
#include "platform/line/Encryption.h"
#include "platform/line/Internet.h"
#include "session/SessionState.h"

namespace lumora {

// The choices of a lab's installer, made once for a machine. Each value starts as the built-in default; LabFile
// replaces those that the lab's file gives, and LoadDefaultProfile sets the session from it.
struct Deployment {
    Deployment();

    // AdFile1 and AdFile2 stay empty here, since their folder follows the drive root, which is known at run time.
    // AdUrl1, AdUrl2 and PriceListUrl2 follow SiteUrl and PriceListUrl.
    ClientProfile profile;

    FtpType ftpType = FtpType::Ascii; // only the FTP line uses it; dwType is 1 with both
    LineEncryption encryption;
    bool keptFtpSession = false; // one session a pass; else one a file
    int ftpLines = 1;            // with a kept session: connections that files go by at once
    Sender SugSheliach = Sender::Ftp;
    std::int16_t HaKoopon = 0;
    std::int16_t DeliveryChoiceMode = 0;
    bool TachanaMekomit = false;
    bool DoarReshut = false;
    std::int16_t MediniyutDchisa = 2;
    bool DchisatAlbum = true;
    std::int16_t GvulMuzag = 1;
    bool FitMuzag = false;
    std::int16_t TmunatPaar = 0;
    std::int16_t MinuyPaar = 1;
    bool SplitPage = false;
    std::int16_t SugTzad = 40;
    bool Careful = false;
    bool watchedCards = false; // cards and sticks show themselves; else they are found by looking
    bool OperatorArea = true;
    bool OperatorEditor = false;
    bool contrast = false; // pages in black on white with strong edges
    bool Waiting = false;  // orders that did not arrive are sent by themselves while nobody is at the start page
    bool KeepLog = false;  // steps, codes and times, for those who look after the station
    ScreenKeys screenKeys = ScreenKeys::Never;
    AlbumTail albumTail = AlbumTail::Customer;
    DoorRules door;
    KioskRules kiosk;
    LabTexts texts;

    QChar programLetter = u'C'; // letter of the program's own drive
    QString dataFolder;         // host folder behind it; empty: the user's data folder
    QString driveOrder;         // letters in the order in which drives are offered, "EDZ"; the others follow

    bool operator==(const Deployment&) const = default;
};

} // namespace lumora
