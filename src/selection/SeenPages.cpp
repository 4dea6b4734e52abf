#include "selection/SeenPages.h"

#include "selection/FolderPager.h"
#include "session/SessionState.h"

namespace lumora {

void SeenPages::seen(Page page) {
    if (!m_state.Careful)
        return;
    // A round through the chosen pictures that begins again replaces the one before.
    while (page.of == Of::Chosen && page.start == 0 && !m_pages.empty() && m_pages.back().of == Of::Chosen)
        m_pages.pop_back();
    m_pages.push_back(page);
}

void SeenPages::stay() {
    const std::size_t count = m_pages.size();
    const bool stays = count > 1 && m_pages[count - 1] == m_pages[count - 2];
    if (m_state.Careful && count > 0 && !stays)
        m_pages.push_back(m_pages.back());
}

std::optional<SeenPages::Page> SeenPages::goBack(int lines) {
    if (!m_state.Careful || m_pages.empty())
        return std::nullopt;
    // Pages of chosen pictures may be gone with their lines.
    do {
        if (m_pages.size() == 1)
            break;
        m_pages.pop_back();
    } while (m_pages.back().of == Of::Chosen && m_pages.back().start >= lines);
    return m_pages.back();
}

bool SeenPages::hasNext(const FolderPager& folders) const {
    return !m_state.Careful || !folders.isAtEnd();
}

bool SeenPages::hasPrevious(std::optional<int> start) const {
    return m_state.Careful ? m_pages.size() > 1 : start != 0;
}

int SeenPages::behindChosenPage(int start, int position, int lines) const {
    return m_state.Careful && start + cellsOfPage >= lines ? 0 : position;
}

} // namespace lumora
