#pragma once

#include "session/Controls.h"

#include <QObject>
#include <QString>

namespace lumora {

// The pages by their design names.
enum class PageId {
    hatchala, // the start page
    nnn,      // kind of order, details, options
    Havharot, // clarifications and warnings
    kyoskNew, // choosing the pictures
    tFrmNew,  // the editor
    BigPics,  // the editor's work picture
    RedI,     // red-eye
    mikledet, // on-screen keyboard
    gdisave,  // saves pictures, never seen
    Form3,
    B3,         // preparing an edited order
    Form2,      // preparing a plain order
    FtpFrm,     // sending by FTP
    UploadForm, // sending by HTTP
    InetForm,   // the two reports, never seen
    MoogMeret,  // finished orders
    SpltForm,   // pieces
};

QString pageName(PageId id);

// Everything that one page decides and shows. A view renders it; pages are made by the page chain, load() runs when a
// page is made, and a page that hands over is deleted once its handlers have returned.
class Page : public QObject {
    Q_OBJECT
public:
    explicit Page(PageId id)
        : m_id(id) {}

    PageId id() const { return m_id; }
    // What views, scenarios and tests read of the page; a page without controls has none.
    virtual const Controls& controls() const;
    virtual void load() {}
    // Sets all the page's texts in the language of the session.
    virtual void setTexts() {}
    // Works by itself, and is not to be cut when nobody is there.
    virtual bool isWorking() const { return false; }
    // The customer has come to an end here: a kiosk goes back without asking.
    virtual bool isAtRest() const { return false; }
    // Nothing on it comes of a customer.
    virtual bool isUntouched() const { return false; }
    // Nobody is there any more, and the page will be taken away.
    virtual void leftAlone() {}

Q_SIGNALS:
    // A view renders once, however often this is sent meanwhile.
    void changed();

private:
    PageId m_id;
};

} // namespace lumora
