// The wording of the lab's own area of the page that sends by FTP. Names of commands stand as the lab's people know
// them.
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/CaptionTexts.h"
#include "transfer/ftp/FtpFrm.h"

namespace lumora {

using namespace Qt::StringLiterals;

void FtpFrm::setLabTexts() {
    setCaptions(m_state, {{Label4ToSend, u"קבצים לשליחה", u"Files to be sent"},
                          {Label4OnServer, u"נמצאים בשרת", u"On the server"},
                          {Label4Failed, u"שליחה שנכשלה", u"Failed"},
                          {Label4Remains, u"שאריות למחיקה", u"Remains to delete"},
                          {Label4Log, u"יומן", u"Log"},
                          {Label4List9, u"ברשימה List9:", u"In List9:"},
                          {Label4Hamtana, u"מומלץ להמתין 30 שניות ואז ללחוץ על הלחצן  שלח שוב",
                           u"It is advised to wait 30 seconds and then press Send again"},
                          {Frame9, u"סבב שלא הושלם:", u"Round that was not complete:"},
                          {Command13, u"לפני שליחה", u"Before sending"},
                          {Command1, u"משלוח חוזר", u"Resend"},
                          {Command2, u"מילוי ושליחה", u"Refill and send"},
                          {Command4, u"שליחה בסבבים", u"Send in rounds"},
                          {Command21, u"Stop"},
                          {Label4Orders, u"רצף הזמנות", u"Chain of orders"},
                          {Label4Rezef, u"אין רצף של הזמנות לשליחה.", u"There is no chain of orders to send."},
                          {Command17, u"SendOneOrder"},
                          {Command19, u"All Orders"},
                          {Command25, u"BdikaAfterUploadB"},
                          {Label4Manual, u"קשר ידני", u"Connection by hand"},
                          {cmdInternetOpen, u"פתיחת קשר", u"Connect"},
                          {cmdClosehOpen, u"סגירת קשר", u"Close the connection"},
                          {chkPassive, u"פסיבי", u"Passive"},
                          {optBin, u"בינארי", u"Binary"},
                          {optAscii, u"ASCII"},
                          {Label4Proxy, u"TIS Compatible Proxy (No CERN):"},
                          {Command3, u"put"},
                          {Command5, u"get"},
                          {Command6, u"del"},
                          {Command7, u"make dir"},
                          {Label4File1, u"במחשב זה", u"On this computer"},
                          {Label4Home, u"תיקיית הכניסה", u"Login folder"},
                          {Label4Level1, u"רמה ראשונה", u"First level"},
                          {Label4Level2, u"תיקיות ההזמנות", u"Order folders"},
                          {Label4Present, u"התיקייה הנוכחית", u"Present folder"}});
}

void FtpFrm::showHasArrived() {
    m_platform.dialogs.message(
        phase() == SendingPhase::Success
            ? wording(u"כל ההזמנה כבר הגיעה.", u"The whole order has arrived already.")
            : wording(u"כל הקבצים של משלוח זה כבר הגיעו.", u"All files of this sending have arrived already."));
}

void FtpFrm::showFailedByHand() {
    const QString reply = m_sender.session.LastResponse.simplified();
    status(wording(u"הפעולה נכשלה והקשר נסגר", u"The step failed and the connection is closed") +
           (reply.isEmpty() ? QString() : u": "_s + reply));
}

void FtpFrm::showStoppedByHand() {
    status(wording(u"הפעולה נעצרה", u"The step was stopped"));
}

} // namespace lumora
