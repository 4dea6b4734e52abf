#include "selection/PictureChoice.h"

#include "order/EditRecord.h"
#include "session/SessionState.h"

#include <algorithm>

namespace lumora {

std::optional<QString> PictureChoice::recordOf(const QString& path) const {
    const int index = m_basket.FindByPath(path);
    if (index < 0)
        return std::nullopt;
    return BasketLine::split(m_basket.item(index), m_basket.form()).editState;
}

PrintCode PictureChoice::code(int copies, PaperWords words) {
    const OrderDetails& order = m_state.shemot;
    m_paper = paperLetter(order.maat, words, m_paper);
    return {copies, sizeField(order), m_paper, order.Bord};
}

void PictureChoice::put(const BasketLine& line) {
    const QString text = line.compose(m_basket.form());
    if (const int index = m_basket.FindByPath(line.path.text()); index >= 0)
        m_basket.replaceAt(index, text);
    else
        m_basket.append(text);
}

void PictureChoice::turnTo(const QStringList& paths) {
    m_page.clear();
    for (const QString& path : paths)
        m_page.append(m_worked(path));
    markPage();
}

void PictureChoice::nextPage() {
    if (!hasNextPage())
        return;
    m_seen.seen({SeenPages::Of::Folders, m_folders.currentIndex()});
    readFolderPage();
}

bool PictureChoice::hasPreviousPage() const {
    const bool ofFolders = m_inView && m_inView->of == SeenPages::Of::Folders;
    return !m_folders.isEmpty() && m_seen.hasPrevious(ofFolders ? std::optional(m_inView->start) : std::nullopt);
}

std::optional<PictureChoice::Range> PictureChoice::range() const {
    if (!m_inView || m_page.isEmpty())
        return std::nullopt;
    const int shown = m_page.count();
    if (m_inView->of == SeenPages::Of::Folders)
        return Range{m_inView->of, m_inView->start, shown, std::max(m_folders.count(), m_inView->start + shown)};
    if (std::find(m_copies.begin(), m_copies.begin() + shown, 0) != m_copies.begin() + shown)
        return std::nullopt; // one of the page is chosen no more
    return Range{m_inView->of, m_inView->start, shown, m_basket.count()};
}

void PictureChoice::readFolderPage() {
    m_inView = {SeenPages::Of::Folders, m_folders.currentIndex()};
    turnTo(m_folders.FillPageList());
}

void PictureChoice::previousPage() {
    const std::optional<SeenPages::Page> before = m_seen.goBack(m_basket.count());
    if (!before) {
        m_folders.PageBack();
        readFolderPage();
    } else if (before->of == SeenPages::Of::Folders) {
        m_folders.setCurrentIndex(before->start);
        readFolderPage();
    } else {
        m_basket.setCurrentIndex(before->start);
        readChosenPage();
    }
}

void PictureChoice::chosenPage() {
    m_seen.seen({SeenPages::Of::Chosen, std::max(m_basket.currentIndex(), 0)});
    readChosenPage();
}

void PictureChoice::readChosenPage() {
    // The reading position of a basket that was never paged is -1; its page begins with the first line.
    const int start = std::max(m_basket.currentIndex(), 0);
    int index = start;
    const int column = BasketLine::pathColumn(m_basket.form());
    const QStringList paths = FillPage(m_basket.lines().items(), index, [column](const QString& line) {
        return line.trimmed().isEmpty() ? QString() : line.mid(column);
    });
    m_basket.setCurrentIndex(m_seen.behindChosenPage(start, index, m_basket.count()));
    m_inView = {SeenPages::Of::Chosen, start};
    turnTo(paths);
}

void PictureChoice::showAlone(const QStringList& paths) {
    m_seen.stay();
    if (std::ranges::all_of(paths, [this](const QString& path) { return m_shownAlone.contains(path); }))
        m_shownAlone.clear();
    QStringList next = paths;
    if (paths.size() > cellsOfPage) {
        next.removeIf([this](const QString& path) { return m_shownAlone.contains(path); });
        next.resize(std::min<qsizetype>(next.size(), cellsOfPage));
    }
    m_shownAlone += next;
    m_inView.reset();
    turnTo(next);
}

void PictureChoice::markPage() {
    m_copies.fill(0);
    for (int cell = 0; cell < m_page.count(); ++cell) {
        if (const int index = m_basket.FindByPath(path(cell)); index >= 0)
            m_copies[static_cast<std::size_t>(cell)] = PrintCode::copiesOf(m_basket.item(index));
    }
}

void PictureChoice::takeBack(const QStringList& basket, const QStringList& pictures) {
    clear();
    m_folders.takeBack(pictures);
    for (const QString& line : basket)
        m_basket.append(line);
}

void PictureChoice::clear() {
    m_folders.clear();
    m_basket.clear();
    m_seen.clear();
    m_shownAlone.clear();
    m_inView.reset();
    turnTo({});
}

void PictureChoice::choose(int cell, const QString& record) {
    put({code(std::max(copies(cell), 1), PaperWords::All).compose(), record, DrivePath(path(cell))});
    markPage();
}

void PictureChoice::setCopies(int cell, int copies) {
    copies = std::clamp(copies, 0, PrintCode::mostCopies);
    const int index = m_basket.FindByPath(path(cell));
    if (copies == 0)
        m_basket.removeAt(index);
    else if (index >= 0)
        m_basket.replaceAt(index, BasketLine::withCopies(m_basket.item(index), copies));
    else
        put({code(copies, PaperWords::All).compose(), EditRecord::newPicture(), DrivePath(path(cell))});
    markPage();
}

void PictureChoice::remove(const QString& path) {
    m_basket.removeAt(m_basket.FindByPath(path));
    markPage();
}

void PictureChoice::chooseAll(const std::function<bool(const QString&)>& isUnreadable) {
    for (const QString& listed : m_folders.paths().items()) {
        const QString path = m_worked(listed);
        if (isUnreadable && isUnreadable(path))
            continue;
        const int index = m_state.Careful ? m_basket.FindByPath(path) : -1;
        const int copies = index < 0 ? 1 : PrintCode::copiesOf(m_basket.item(index));
        const PaperWords words = m_state.Careful ? PaperWords::All : PaperWords::WholeFolder;
        put({code(copies, words).compose(), {}, DrivePath(path)});
    }
}

void PictureChoice::changePaper(const OrderDetails& before, const PictureSizeOf& sizeOf) {
    for (int i = 0; i < m_basket.count(); ++i) {
        BasketLine line = BasketLine::split(m_basket.item(i), m_basket.form());
        line.code = code(PrintCode::copiesOf(m_basket.item(i)), PaperWords::All).compose();
        if (m_basket.form() == LineForm::Full)
            line.editState = RecordOnPaper(line.editState, sizeOf(line.path.text()), before, m_state.shemot);
        m_basket.replaceAt(i, line.compose(m_basket.form()));
    }
    markPage();
}

int PictureChoice::storeRecord(const QString& path, const QString& record) {
    const int index = m_basket.FindByPath(path);
    // The copies are those of the line, since another page may be in view by now.
    if (index >= 0)
        put({code(PrintCode::copiesOf(m_basket.item(index)), PaperWords::All).compose(), record, DrivePath(path)});
    return index;
}

} // namespace lumora
