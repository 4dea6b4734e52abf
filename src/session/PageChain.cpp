#include "session/PageChain.h"

#include "platform/Machine.h"

#include <QThread>
#include <QTimer>

#include <algorithm>
#include <cassert>
#include <utility>

namespace lumora {

namespace {

constexpr int untilFree = 20; // milliseconds between two looks

} // namespace

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
    if (hasEnded() || !isRegistered(id))
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
    if (hasEnded() || !wasShown)
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
    if (isFree())
        m_left.clear();
    else
        QTimer::singleShot(untilFree, this, &PageChain::deleteLeft);
}

bool PageChain::isFree() const {
    return !m_pump.pumping() && QThread::currentThread()->loopLevel() <= 1;
}

void PageChain::goToStart() {
    if (std::exchange(m_goesToStart, true))
        return;
    QTimer::singleShot(0, this, &PageChain::startAnew);
}

// The pages are gone before the start page comes, so that nothing of theirs is written behind it.
void PageChain::startAnew() {
    if (m_ended)
        return;
    if (!isFree()) {
        QTimer::singleShot(untilFree, this, &PageChain::startAnew);
        return;
    }
    while (!m_pages.empty())
        unload(m_pages.begin()->first);
    m_left.clear();
    m_goesToStart = false;
    show(PageId::hatchala);
}

bool PageChain::isAnyWorking() const {
    return std::any_of(m_pages.begin(), m_pages.end(), [](const auto& page) { return page.second->isWorking(); });
}

void PageChain::setAllTexts() const {
    for (const auto& [id, page] : m_pages)
        page->setTexts();
}

Page* PageChain::find(PageId id) const {
    const auto at = m_pages.find(id);
    return at == m_pages.end() ? nullptr : at->second.get();
}

void PageChain::endProgram() {
    if (m_ended)
        return;
    if (mayEnd && !mayEnd()) {
        goToStart();
        return;
    }
    m_ended = true;
    Q_EMIT ended();
}

} // namespace lumora
