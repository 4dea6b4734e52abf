#pragma once

#include <QMetaObject>

#include <memory>
#include <mutex>
#include <utility>

namespace lumora {

// Where threads hand in results to a QObject that may have gone by then. The last member of its owner, so that nothing
// is handed in while the others go.
template <class Owner>
class ResultDesk {
    struct Shared {
        std::mutex mutex;
        Owner* owner;
    };

public:
    explicit ResultDesk(Owner* owner)
        : m_shared(std::make_shared<Shared>()) {
        m_shared->owner = owner;
    }
    ResultDesk(const ResultDesk&) = delete;
    ResultDesk& operator=(const ResultDesk&) = delete;
    ~ResultDesk() {
        const std::lock_guard lock(m_shared->mutex);
        m_shared->owner = nullptr;
    }

    // What a thread takes along; copied freely.
    class Ticket {
    public:
        // settle(owner) is called in the owner's thread, from its event loop; never where the owner has gone.
        template <class Settle>
        void handIn(Settle settle) const {
            const std::lock_guard lock(m_shared->mutex);
            if (Owner* owner = m_shared->owner)
                QMetaObject::invokeMethod(
                    owner, [owner, settle = std::move(settle)] { settle(*owner); }, Qt::QueuedConnection);
        }

    private:
        friend class ResultDesk;
        explicit Ticket(std::shared_ptr<Shared> shared)
            : m_shared(std::move(shared)) {}

        std::shared_ptr<Shared> m_shared;
    };
    Ticket ticket() const { return Ticket(m_shared); }

private:
    std::shared_ptr<Shared> m_shared;
};

} // namespace lumora
