#pragma once

#include <QString>

#include <vector>

namespace lumora {

struct Caption;
class TextList;

// The controls of a page by their design names. A control that is declared with the page's controls and its name enters
// itself, so that a view, a scenario or a test finds it whether a widget shows it or not.
class Controls {
public:
    struct Entry {
        QString name;
        const Caption* caption = nullptr; // one of the two
        const TextList* list = nullptr;
    };

    Controls() = default;
    Controls(const Controls&) = delete;
    Controls& operator=(const Controls&) = delete;

    const std::vector<Entry>& all() const { return m_entries; }
    // Null for a name that no control of the page has.
    const Entry* find(const QString& name) const;
    // The design name of a control of this page, empty for any other.
    QString nameOf(const Caption& caption) const;
    QString nameOf(const TextList& list) const;

protected:
    ~Controls() = default;

private:
    friend struct Caption;
    friend class TextList;

    std::vector<Entry> m_entries;
};

} // namespace lumora
