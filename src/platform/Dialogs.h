#pragma once

#include "common/DrivePath.h"
#include "common/Result.h"
#include "platform/files/HostPath.h"

#include <QString>

namespace lumora {

// Boxes and questions outside the controls of a page. On screen each is a panel over the page; tests record the texts.
class Dialogs {
public:
    virtual ~Dialogs() = default;

    // Shows a box with one button and returns at once. Boxes queue up; the page goes on below them.
    virtual void message(const QString& text, const QString& title = {}) = 0;

    // Waits for the answer; closing the box counts as no.
    virtual bool ask(const QString& question, const QString& title = {}) = 0;

    // Lets the customer pick one file. Gives its drive path, empty when the customer cancels; a character outside the
    // code page is "?". prompt stands above the list. With EveryFile the list opens at initialFolder, with Pictures at
    // the media that customers bring.
    enum class Offer { Pictures, EveryFile };
    virtual DrivePath pickFile(const QString& prompt, const DrivePath& initialFolder, const QString& title,
                               Offer offer = Offer::Pictures) = 0;

    // Shows an HTML file of this machine over the page and returns at once; nothing of it leads out of it. Fails when
    // it can't be read.
    virtual Result<void> showText(const HostPath& file, const QString& title) = 0;

    // A question or the picker waits for a person.
    virtual bool isWaiting() const { return false; }
    // As if the person had closed all of them.
    virtual void closeAll() {}
};

} // namespace lumora
