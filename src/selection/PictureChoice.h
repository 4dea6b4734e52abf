#pragma once

#include "common/DrivePath.h"
#include "selection/Basket.h"
#include "selection/ChangedPaper.h"
#include "selection/FolderPager.h"
#include "selection/SeenPages.h"

#include <array>
#include <functional>
#include <optional>

namespace lumora {

struct SessionState;

// What the customer chooses from and what is chosen: the folders picked so far, the twelve cells of the page in view
// with the copies of each, and the basket. The paper, the size and the border of a line are those that the order has
// when the line is written.
class PictureChoice {
public:
    explicit PictureChoice(const SessionState& state)
        : m_state(state)
        , m_seen(state) {}
    // Once, before any picture is chosen.
    void setForm(LineForm form) { m_basket.setForm(form); }
    // What the page works with in the place of a picture of a folder (selection/door/PictureDoor.h). Without it each
    // picture stands for itself.
    void setWorked(std::function<QString(const QString&)> worked) { m_worked = std::move(worked); }

    const Basket& basket() const { return m_basket; }
    const FolderPager& folders() const { return m_folders; }
    // The paths of the page in view, one a cell, as the page works with them; those of the folders are as they lie
    // there.
    const TextList& page() const { return m_page; }
    // Empty for a cell without a picture.
    QString path(int cell) const { return m_page.item(cell); }
    // The number that the cell shows, 0 to 99: the copies of its picture, the same in each cell that shows it.
    int copies(int cell) const { return m_copies.at(static_cast<std::size_t>(cell)); }
    bool chosen(int cell) const { return copies(cell) > 0; }
    bool inBasket(const QString& path) const { return m_basket.FindByPath(path) >= 0; }
    // The edit record of a chosen picture in an order of the full form.
    std::optional<QString> recordOf(const QString& path) const;

    int addFolder(const DrivePath& folder, const QStringList& names) { return m_folders.addFolder(folder, names); }
    // False when the page behind the last one is asked for and there is none.
    bool hasNextPage() const { return !m_folders.isEmpty() && m_seen.hasNext(m_folders); }
    bool hasPreviousPage() const;
    // Which pictures are in view, among those of the folders or of the basket; none for a page of some alone.
    struct Range {
        SeenPages::Of of;
        int start;
        int count;
        int all;
    };
    std::optional<Range> range() const;
    void nextPage();
    void previousPage();
    // A page of the basket's own pictures, from its reading position on.
    void chosenPage();
    // A page of these pictures; the page before it is the one in view. Of more than twelve each call shows the next
    // ones that were not shown so, and behind the last it begins again.
    void showAlone(const QStringList& paths);
    // The copies of the cells are read from the basket again.
    void markPage();
    // Takes what was chosen before, and the pictures that it was chosen from.
    void takeBack(const QStringList& basket, const QStringList& pictures);
    // No folder, no page and nothing chosen.
    void clear();

    // A picture that is chosen already keeps its copies and its place in the basket. record is empty in the short form.
    void choose(int cell, const QString& record);
    // The rest of a line stays, its record too; a line that is added has the record of a new picture. 0 copies remove
    // the line.
    void setCopies(int cell, int copies);
    // A picture that can't be printed after all.
    void remove(const QString& path);
    // Every picture of the folders but those that can't be read. As built in, each has one copy then, and the English
    // words give no paper letter.
    void chooseAll(const std::function<bool(const QString&)>& isUnreadable = {});
    // The index of the line that has the record now, or -1 when the picture is not chosen.
    int storeRecord(const QString& path, const QString& record);
    // The paper, its kind or the border of the order is another one than before: each line has its code and its record
    // for it.
    void changePaper(const OrderDetails& before, const PictureSizeOf& sizeOf);
    void removeDuplicates() { m_basket.removeDuplicates(); }

private:
    PrintCode code(int copies, PaperWords words);
    void put(const BasketLine& line);
    void readFolderPage();
    void readChosenPage();
    void turnTo(const QStringList& paths);

    const SessionState& m_state;
    std::function<QString(const QString&)> m_worked = [](const QString& path) { return path; };
    Basket m_basket;
    FolderPager m_folders;
    SeenPages m_seen;
    TextList m_page;
    std::optional<SeenPages::Page> m_inView; // none for a page of some pictures alone
    QStringList m_shownAlone;                // paths, in this round
    std::array<int, cellsOfPage> m_copies{};
    QChar m_paper = u' '; // the letter of the line before, for a paper word that is not known
};

} // namespace lumora
