#include "assembly/plain/PlainPreparation.h"

#include "assembly/PaperResize.h"
#include "assembly/plain/PlainPrints.h"
#include "common/FixedText.h"
#include "order/BasketLine.h"
#include "order/KeptPictures.h"
#include "order/OrderNames.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/TextList.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

BasketLine split(const QString& line) {
    return BasketLine::split(line, LineForm::Short);
}

// As built in, only these two spellings that cameras write pass.
bool isJpegItem(const QString& item, bool careful) {
    const QString ending = item.right(3);
    return careful ? ending.compare(u"jpg", Qt::CaseInsensitive) == 0 : ending == u"JPG" || ending == u"jpg";
}

} // namespace

void PlainPreparation::keepOnlyJpeg(TextList& lines, TextList& removed) {
    for (int i = 0; i < lines.count(); ++i) {
        if (isJpegItem(lines.item(i), m_state.Careful))
            continue;
        const DrivePath picture = split(lines.item(i)).path;
        removed.append(picture.text());
        m_noJpeg += LeftOut{picture, LeftOut::Why::NoJpeg};
        lines.removeAt(i);
    }
}

bool PlainPreparation::isAlbum() const {
    return m_state.Optint == OrderKind::Album;
}

std::vector<SheetCell> PlainPreparation::cellsOf(const QStringList& lines) const {
    std::vector<SheetCell> cells;
    const KeptPictures kept(m_platform.files, m_state.keptFolder);
    for (const QString& line : lines)
        cells.push_back(
            {kept.hostOf(split(line).path), split(line).copiesField() + u'_' + RightPart(split(line).path.stem(), 9)});
    return cells;
}

QList<SheetLine> PlainPreparation::textsOf(SheetKind kind) const {
    const QDateTime now = m_platform.clock.now();
    return kind == SheetKind::Album ? albumSheetLines(m_state, now) : plainSheetLines(m_state, now);
}

std::optional<Bitmap> PlainPreparation::drawSheet(SheetKind kind, const QStringList& lines) {
    return Preparation::drawSheet(kind, lines, textsOf(kind), cellsOf(lines));
}

bool PlainPreparation::prepare(const QStringList& lines) {
    begin(lines);
    // The sheet shows the number.
    if (!claimFolder(OrderFolder::Ending::BySession, Sender::Ftp))
        return false;
    PlainPrints prints(m_state, m_platform.files, m_lines, notMade());
    if (!makeSheet(prints))
        return false;

    PrintPacker packer(m_state, m_platform.files, *m_folder, m_state.SugTzad);
    prints.beginPrints();
    if (!forEachPicture([&](int i) { packPicture(i, packer, prints); }))
        return false;
    if (isHeldBackForPrints())
        return false;
    countOrder();
    return writeLog(isAlbum() ? OrderLog::Layout::Album : OrderLog::Layout::Plain);
}

// A sheet that was drawn before stays: the pictures of an order that goes on may be gone by now.
bool PlainPreparation::makeSheet(PlainPrints& prints) {
    const DrivePath path = m_folder->filePath(SheetName(m_state.MisparHazmana, m_state.shemot.ser, u".jpp"_s));
    if (!m_there.isEmpty() && m_platform.files.fileExists(path))
        return true;
    const SheetKind kind = isAlbum() ? SheetKind::Album : SheetKind::Plain;
    prints.beginSheet(OrderSheet::capacityOf(orderSheetSize(kind, static_cast<int>(m_lines.size()))));
    const std::optional<Bitmap> drawn =
        Preparation::drawSheet(kind, m_lines, textsOf(kind), cellsOf(m_lines),
                               [&](const auto& whileWaiting) { return prints.nextSmall(whileWaiting); });
    if (!drawn)
        return false;
    const Result<QByteArray> sheet = encodeJpeg(*drawn, printQuality);
    const Result<void> saved = sheet ? m_platform.files.writeWhole(path, *sheet) : Result<void>(sheet.failure());
    if (!saved && isHeldBackForSheet(saved.failure()))
        return false;
    if (!saved)
        notWritten(saved.failure());
    return true;
}

void PlainPreparation::packPicture(int index, PrintPacker& packer, PlainPrints& prints) {
    const BasketLine line = split(m_lines[index]);
    packer.beginStep();
    if (!line.hasUsableName())
        return;
    // The selection page writes a question mark for a character that the code page lacks.
    if (HasQuestionMark(m_lines[index])) {
        notPrepared(line.path, LeftOut::Why::Name);
        return;
    }
    m_events.inWork(line.path);
    if (isThere(index) || isGivenUp(index, line.path))
        return;
    pack(packer, {index, line.code, line.path},
         [&] { return prints.print(index, [this] { m_platform.pump.pump(); }); });
}

} // namespace lumora
