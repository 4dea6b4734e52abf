#pragma once

#include <optional>
#include <vector>

namespace lumora {

class FolderPager;
struct SessionState;

// The pages of small pictures that the customer has seen, so that "previous" shows the one before. The pages of chosen
// pictures begin again behind their last, and no page follows the last of the folders. As built in, nothing is
// remembered: "previous" goes back by 24, and a page behind the last one shows its last picture again.
class SeenPages {
public:
    explicit SeenPages(const SessionState& state)
        : m_state(state) {}

    enum class Of { Folders, Chosen };
    struct Page {
        Of of;
        int start; // index of its first picture, among those of the folders or the basket's lines
        bool operator==(const Page&) const = default;
    };

    void clear() { m_pages.clear(); }
    void seen(Page page);
    // A page that is not remembered comes over the one in view, or takes the place of one that is not remembered.
    void stay();
    // The page that was seen before the one in view; the first stays. No value as built in.
    std::optional<Page> goBack(int lines);
    bool hasNext(const FolderPager& folders) const;
    // False where goBack() would show the page in view again. start: its first picture of the folders, if it is of
    // them.
    bool hasPrevious(std::optional<int> start) const;
    // The reading position behind a page of chosen pictures. position: where the reading stopped.
    int behindChosenPage(int start, int position, int lines) const;

private:
    const SessionState& m_state;
    std::vector<Page> m_pages; // the last one is in view
};

} // namespace lumora
