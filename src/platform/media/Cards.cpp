#include "platform/media/Cards.h"

#include <QDeadlineTimer>

#include <algorithm>
#include <chrono>
#include <utility>

namespace lumora {

namespace {

constexpr std::chrono::seconds patienceAtTheEnd(3);

} // namespace

struct Cards::Entry {
    Card card;
    std::shared_ptr<std::atomic_bool> stop = std::make_shared<std::atomic_bool>(false);
};

Cards::Cards(Source source, bool everyFormat)
    : m_source(std::move(source))
    , m_everyFormat(everyFormat) {}

Cards::~Cards() {
    for (const auto& entry : m_cards)
        *entry->stop = true;
    if (m_thread)
        endThread();
    // A thread that hangs is left behind: the program ends all the same.
    const QDeadlineTimer patience(patienceAtTheEnd);
    for (const std::vector<QThread*>& threads : {m_ending, m_counts}) {
        for (QThread* thread : threads) {
            if (thread->wait(patience))
                delete thread;
        }
    }
}

void Cards::watch() {
    if (++m_watchers > 1 || !m_source)
        return;
    RemovableMedia* media = m_source().release();
    auto* thread = new QThread();
    m_thread = thread;
    media->moveToThread(thread);
    connect(thread, &QThread::started, media, &RemovableMedia::begin);
    connect(thread, &QThread::finished, media, &QObject::deleteLater);
    connect(thread, &QThread::finished, this, [this, thread] {
        std::erase(m_ending, thread);
        thread->deleteLater();
    });
    connect(media, &RemovableMedia::found, this, [this, thread](const std::vector<Medium>& found) {
        if (m_thread == thread)
            take(found);
    });
    m_thread->start();
}

void Cards::unwatch() {
    if (--m_watchers > 0 || !m_thread)
        return;
    endThread();
    // Nobody is told: the last watcher may be half destroyed.
    while (!m_cards.empty())
        forget(m_cards.size() - 1);
}

// Nobody waits for it: a bus or a card that hangs would hold the window.
void Cards::endThread() {
    m_thread->quit();
    m_ending.push_back(std::exchange(m_thread, nullptr));
}

std::vector<Cards::Card> Cards::all() const {
    std::vector<Card> cards;
    for (const auto& entry : m_cards)
        cards.push_back(entry->card);
    return cards;
}

void Cards::take(const std::vector<Medium>& media) {
    bool differs = false;
    for (std::size_t i = m_cards.size(); i-- > 0;) {
        if (std::find(media.begin(), media.end(), m_cards[i]->card.medium) == media.end()) {
            forget(i);
            differs = true;
        }
    }
    for (const Medium& medium : media) {
        const bool known = std::any_of(m_cards.begin(), m_cards.end(),
                                       [&](const auto& entry) { return entry->card.medium == medium; });
        if (known)
            continue;
        m_cards.push_back(std::make_unique<Entry>());
        m_cards.back()->card.medium = medium;
        count(*m_cards.back());
        differs = true;
    }
    if (differs)
        Q_EMIT changed();
}

void Cards::forget(std::size_t entry) {
    *m_cards[entry]->stop = true;
    m_cards.erase(m_cards.begin() + static_cast<std::ptrdiff_t>(entry));
}

void Cards::count(Entry& entry) {
    const auto summary = std::make_shared<CardSummary>();
    const auto stop = entry.stop;
    const auto looked = std::make_shared<std::function<void()>>();
    QThread* counting =
        QThread::create([summary, stop, looked, look = m_look, root = entry.card.medium.folder, every = m_everyFormat] {
            *summary = summaryOfCard(root, *stop, every);
            if (look)
                *looked = look();
        });
    m_counts.push_back(counting);
    connect(counting, &QThread::finished, this, [this, counting, summary, stop, looked] {
        std::erase(m_counts, counting);
        counting->deleteLater();
        const auto card =
            std::find_if(m_cards.begin(), m_cards.end(), [&](const auto& counted) { return counted->stop == stop; });
        if (card == m_cards.end())
            return;
        if (*looked)
            (*looked)();
        (*card)->card.summary = *summary;
        Q_EMIT changed();
    });
    counting->start();
}

} // namespace lumora
