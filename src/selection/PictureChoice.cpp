#include "selection/PictureChoice.h"

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
    m_paper = paperLetter(m_order.maat, words, m_paper);
    return {copies, sizeField(m_order), m_paper, m_order.Bord};
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
    m_page.append(paths);
    markPage();
}

void PictureChoice::nextPage() {
    turnTo(m_folders.FillPageList());
}

void PictureChoice::previousPage() {
    m_folders.PageBack();
    nextPage();
}

void PictureChoice::chosenPage() {
    // The reading position of a basket that was never paged is -1; its page begins with the first line.
    int index = std::max(m_basket.currentIndex(), 0);
    const int column = BasketLine::pathColumn(m_basket.form());
    const QStringList paths = FillPage(m_basket.lines().items(), index, [column](const QString& line) {
        return line.trimmed().isEmpty() ? QString() : line.mid(column);
    });
    m_basket.setCurrentIndex(index);
    turnTo(paths);
}

void PictureChoice::markPage() {
    m_copies.fill(0);
    for (int cell = 0; cell < m_page.count(); ++cell) {
        if (const int index = m_basket.FindByPath(path(cell)); index >= 0)
            m_copies[static_cast<std::size_t>(cell)] = PrintCode::copiesOf(m_basket.item(index));
    }
}

void PictureChoice::clear() {
    m_folders.clear();
    m_basket.clear();
    turnTo({});
}

void PictureChoice::choose(int cell, const QString& record) {
    const PrintCode now = code(std::max(copies(cell), 1), PaperWords::All);
    m_copies[static_cast<std::size_t>(cell)] = now.copies;
    put({now.compose(), record, DrivePath(path(cell))});
}

void PictureChoice::setCopies(int cell, int copies, const QString& record) {
    copies = std::clamp(copies, 0, PrintCode::mostCopies);
    m_copies[static_cast<std::size_t>(cell)] = copies;
    const int index = m_basket.FindByPath(path(cell));
    if (copies == 0)
        m_basket.removeAt(index);
    else if (index >= 0)
        m_basket.replaceAt(index, BasketLine::withCopies(m_basket.item(index), copies));
    else
        put({code(copies, PaperWords::All).compose(), record, DrivePath(path(cell))});
}

void PictureChoice::chooseAll() {
    for (const QString& path : m_folders.paths().items())
        put({code(1, PaperWords::WholeFolder).compose(), {}, DrivePath(path)});
}

int PictureChoice::storeRecord(const QString& path, const QString& record) {
    const int index = m_basket.FindByPath(path);
    // The copies are those of the line, since another page may be in view by now.
    if (index >= 0)
        put({code(PrintCode::copiesOf(m_basket.item(index)), PaperWords::All).compose(), record, DrivePath(path)});
    return index;
}

} // namespace lumora
