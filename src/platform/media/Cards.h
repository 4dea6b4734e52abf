#pragma once

#include "platform/media/CardSummary.h"
#include "platform/media/RemovableMedia.h"

#include <QObject>
#include <QThread>

#include <functional>
#include <memory>
#include <optional>
#include <utility>

namespace lumora {

// The cards and sticks that are in while somebody watches, with what each holds. Looking for them and counting run on
// threads of their own.
class Cards : public QObject {
    Q_OBJECT
public:
    using Source = std::function<std::unique_ptr<RemovableMedia>()>;
    // Without a source nothing is ever in. everyFormat: what counts as a picture, see isPictureFile.
    explicit Cards(Source source = {}, bool everyFormat = false);
    ~Cards() override;

    // The lab wants cards to be shown.
    bool areWatched() const { return static_cast<bool>(m_source); }

    // What is to be known of the machine before anybody hears what a card holds. look runs in the thread that counts;
    // what it gives runs in this one.
    using Look = std::function<std::function<void()>()>;
    void setLook(Look look) { m_look = std::move(look); }

    // While one of these lives, media are looked for and, where nobody has mounted them, mounted.
    class Watch {
    public:
        explicit Watch(Cards& cards)
            : m_cards(cards) {
            m_cards.watch();
        }
        ~Watch() { m_cards.unwatch(); }
        Watch(const Watch&) = delete;
        Watch& operator=(const Watch&) = delete;

    private:
        Cards& m_cards;
    };

    struct Card {
        Medium medium;
        std::optional<CardSummary> summary; // none while its pictures are counted
    };
    // The one that came first stands first.
    std::vector<Card> all() const;

Q_SIGNALS:
    void changed();

private:
    struct Entry;
    void watch();
    void unwatch();
    void endThread();
    void take(const std::vector<Medium>& media);
    void count(Entry& entry);
    void forget(std::size_t entry);

    Source m_source;
    bool m_everyFormat;
    int m_watchers = 0;
    Look m_look;
    QThread* m_thread = nullptr;    // the source lives in it
    std::vector<QThread*> m_ending; // of former watches; a service that hangs holds its thread
    std::vector<std::unique_ptr<Entry>> m_cards;
    std::vector<QThread*> m_counts; // also of cards that have gone
};

} // namespace lumora
