#pragma once

#include <QString>

namespace lumora {

// What a page has to say or to ask outside its own controls. On screen each is a panel over the page; in tests a
// recorded text.
class Dialogs {
public:
    virtual ~Dialogs() = default;

    // A box with one button. Returns at once: boxes queue up, and the page goes on below them.
    virtual void message(const QString& text, const QString& title = {}) = 0;

    // Waits for the answer; a box that is closed without one is a no.
    virtual bool ask(const QString& question, const QString& title = {}) = 0;

    // One file, as a drive path; empty when the customer cancels. prompt is what the customer reads above the list. A
    // character of the path that lies outside the code page comes back as "?". Where every file is on offer, the list
    // opens at initialFolder; pictures are first looked for where customers bring them.
    enum class Offer { Pictures, EveryFile };
    virtual QString pickFile(const QString& prompt, const QString& initialFolder, const QString& title,
                             Offer offer = Offer::Pictures) = 0;
};

} // namespace lumora
