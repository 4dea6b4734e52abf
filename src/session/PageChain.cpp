#include "session/PageChain.h"

#include "platform/Machine.h"

#include <QThread>
#include <QTimer>

#include <algorithm>
#include <cassert>

namespace lumora {

PageChain::~PageChain() = default;

void PageChain::registerPage(PageId id, Maker maker) {
    m_makers[id] = std::move(maker);
}

Page& PageChain::load(PageId id) {
    if (Page* existing = find(id))
        return *existing;
    assert(isRegistered(id));
    // Kept before load() runs, so that load() can find its own page in the chain.
    Page& page = *(m_pages[id] = m_makers.at(id)());
    page.load();
    page.setTexts();
    return page;
}

bool PageChain::show(PageId id) {
    if (m_ended || !isRegistered(id))
        return false;
    Page* page = &load(id);
    std::erase(m_shown, page);
    m_shown.push_back(page);
    Q_EMIT shown(page);
    return true;
}

bool PageChain::follow(PageId from, Outcome outcome) {
    const std::optional<PageWay> way = wayFrom(from, outcome);
    if (!way || !show(way->to))
        return false;
    if (way->then == PageWay::From::IsLeft)
        unload(from);
    return true;
}

bool PageChain::canFollow(PageId from, Outcome outcome) const {
    const std::optional<PageWay> way = wayFrom(from, outcome);
    return way && isRegistered(way->to);
}

void PageChain::unload(PageId id) {
    const auto at = m_pages.find(id);
    if (at == m_pages.end())
        return;
    Page* page = at->second.get();
    m_left.push_back(std::move(at->second));
    m_pages.erase(at);
    QTimer::singleShot(0, this, &PageChain::deleteLeft);
    const bool wasFront = front() == page;
    const bool wasShown = std::erase(m_shown, page) > 0;
    Q_EMIT unloaded(page);
    if (m_ended || !wasShown)
        return;
    if (m_shown.empty())
        show(PageId::hatchala);
    else if (wasFront)
        Q_EMIT shown(front());
}

// QObject::deleteLater would delete at the next pump of the very handler that is still running.
void PageChain::deleteLeft() {
    if (m_left.empty())
        return;
    if (m_pump.pumping() || QThread::currentThread()->loopLevel() > 1)
        QTimer::singleShot(20, this, &PageChain::deleteLeft);
    else
        m_left.clear();
}

Page* PageChain::find(PageId id) const {
    const auto at = m_pages.find(id);
    return at == m_pages.end() ? nullptr : at->second.get();
}

void PageChain::endProgram() {
    if (m_ended)
        return;
    m_ended = true;
    Q_EMIT ended();
}

} // namespace lumora
