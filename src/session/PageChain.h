#pragma once

#include "session/PageFlow.h"

#include <functional>
#include <map>
#include <memory>
#include <vector>

namespace lumora {

class EventPump;

// The chain of pages: which exist, which is in front. A page tells what happened; the page flow says which page is
// next.
class PageChain : public QObject {
    Q_OBJECT
public:
    using Maker = std::function<std::unique_ptr<Page>()>;

    explicit PageChain(const EventPump& pump)
        : m_pump(pump) {}
    ~PageChain() override;

    void registerPage(PageId id, Maker maker);

    // The page with this id, made and loaded if it does not exist yet, without bringing it to the front. A service page
    // such as gdisave is used this way.
    Page& load(PageId id);
    // The same as the page's own class.
    template <typename P>
    P& load() {
        return static_cast<P&>(load(P::pageId));
    }

    // Follows the page flow from what happened on a page: shows the next page and unloads the one that is left. False,
    // without any change, when the next page is not registered.
    bool follow(PageId from, Outcome outcome);
    bool canFollow(PageId from, Outcome outcome) const;

    // Loads the page if need be and brings it to the front. False when no page of that id was registered.
    bool show(PageId id);

    // Takes the page out of the chain at once and deletes it when all handlers have returned, also those that wait in a
    // pump for the click that unloads their page. A chain is never without a page in front: when the last one that was
    // shown goes, the start page comes.
    void unload(PageId id);

    Page* find(PageId id) const;
    template <typename P>
    P* find() const {
        return static_cast<P*>(find(P::pageId));
    }
    Page* front() const { return m_shown.empty() ? nullptr : m_shown.back(); }
    bool isRegistered(PageId id) const { return m_makers.contains(id); }

    // Ends the program without saving anything: the process ends on ended(). Where mayEnd says no, goes to the start
    // page instead.
    void endProgram();
    std::function<bool()> mayEnd;
    // Takes all pages away, and the start page comes anew. It waits until no handler can still run, which may work on
    // what the customer has given; a loop that asks hasEnded() stops for it.
    void goToStart();
    bool hasEnded() const { return m_ended || m_goesToStart; }
    bool goesToStart() const { return m_goesToStart; } // the start page comes next

    bool isAnyWorking() const;
    // In the language of the session, and with what the session allows.
    void setAllTexts() const;

Q_SIGNALS:
    void shown(lumora::Page* page);
    void unloaded(lumora::Page* page);
    void ended();

private:
    void deleteLeft();
    bool isFree() const;
    void startAnew();

    const EventPump& m_pump;
    std::map<PageId, Maker> m_makers;
    std::map<PageId, std::unique_ptr<Page>> m_pages;
    std::vector<Page*> m_shown;                // the last one is in front
    std::vector<std::unique_ptr<Page>> m_left; // unloaded, with handlers that may still be running
    bool m_ended = false;
    bool m_goesToStart = false;
};

} // namespace lumora
