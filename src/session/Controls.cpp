#include "session/Controls.h"

#include <algorithm>

namespace lumora {

namespace {

template <typename Matches>
const Controls::Entry* firstOf(const std::vector<Controls::Entry>& entries, Matches matches) {
    const auto at = std::find_if(entries.begin(), entries.end(), matches);
    return at == entries.end() ? nullptr : &*at;
}

} // namespace

const Controls::Entry* Controls::find(const QString& name) const {
    return firstOf(m_entries, [&](const Entry& entry) { return entry.name == name; });
}

QString Controls::nameOf(const Caption& caption) const {
    const Entry* entry = firstOf(m_entries, [&](const Entry& each) { return each.caption == &caption; });
    return entry == nullptr ? QString() : entry->name;
}

QString Controls::nameOf(const TextList& list) const {
    const Entry* entry = firstOf(m_entries, [&](const Entry& each) { return each.list == &list; });
    return entry == nullptr ? QString() : entry->name;
}

} // namespace lumora
