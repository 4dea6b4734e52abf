#include "assembly/plain/PlainPreparation.h"

#include "assembly/PaperResize.h"
#include "assembly/WorkAhead.h"
#include "common/FixedText.h"
#include "common/PaperSize.h"
#include "imaging/files/JpegCheck.h"
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

// The prints of the order, scaled on other threads ahead of the step that packs them; with deep compression the file
// itself, which as built in nobody looks into. That work takes a source path and gives bytes; it shares no state with
// the page.
class PlainPreparation::Prints {
public:
    Prints(const SessionState& state, const Files& files, const QStringList& items, const QSet<int>& there)
        : m_files(files)
        , m_kept(files, state.keptFolder)
        , m_paper(PaperSize::ofText(state.shemot.ppr))
        , m_sources(sourcesToPrint(items, there))
        , m_prints(static_cast<int>(m_sources.size()),
                   [this, deep = state.DchisaAmoka == 1, careful = state.Careful](int i) {
                       return deep ? copying(m_sources[i], careful) : scaling(m_sources[i]);
                   }) {}

    template <class Waiting>
    Result<QByteArray> next(Waiting whileWaiting) {
        return m_prints.take(whileWaiting);
    }

private:
    using Ahead = WorkAhead<Result<QByteArray>>;

    static QList<DrivePath> sourcesToPrint(const QStringList& items, const QSet<int>& there) {
        QList<DrivePath> sources;
        for (int i = 0; i < items.size(); ++i) {
            const BasketLine picture = split(items[i]);
            if (!there.contains(i) && picture.hasUsableName() && !HasQuestionMark(items[i]))
                sources += picture.path;
        }
        return sources;
    }

    Ahead::Work scaling(const DrivePath& path) const {
        const std::optional<HostPath> source = m_kept.hostOf(path);
        return [source, paper = m_paper]() -> Result<QByteArray> {
            if (!source || !paper)
                return Failure{Failure::Kind::NotFound, {}};
            return resizeToPaper(*source, *paper);
        };
    }

    Ahead::Work copying(const DrivePath& picture, bool decoded) const {
        const DrivePath path = m_kept.fileOf(picture);
        const Result<HostPath> source = m_files.host(path);
        return [source, path, decoded, files = &m_files]() -> Result<QByteArray> {
            if (!source)
                return source.failure();
            const Result<void> whole = decoded ? checkJpegDecodes(*source) : Result<void>();
            return whole ? files->read(path) : whole.failure();
        };
    }

    const Files& m_files;
    const KeptPictures m_kept;
    const std::optional<PaperSize> m_paper;
    const QList<DrivePath> m_sources;
    Ahead m_prints;
};

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

std::optional<Bitmap> PlainPreparation::drawSheet(SheetKind kind, const QStringList& lines) {
    const QDateTime now = m_platform.clock.now();
    std::vector<SheetCell> cells;
    const KeptPictures kept(m_platform.files, m_state.keptFolder);
    for (const QString& line : lines)
        cells.push_back(
            {kept.hostOf(split(line).path), split(line).copiesField() + u'_' + RightPart(split(line).path.stem(), 9)});
    return Preparation::drawSheet(
        kind, lines, kind == SheetKind::Album ? albumSheetLines(m_state, now) : plainSheetLines(m_state, now), cells);
}

bool PlainPreparation::prepare(const QStringList& lines) {
    begin(lines);
    // The sheet shows the number.
    if (!claimFolder(OrderFolder::Ending::BySession, Sender::Ftp))
        return false;
    if (!makeSheet())
        return false;

    PrintPacker packer(m_state, m_platform.files, *m_folder, m_state.SugTzad);
    Prints prints(m_state, m_platform.files, m_lines, notMade());
    if (!forEachPicture([&](int i) { packPicture(i, packer, prints); }))
        return false;
    if (isHeldBackForPrints())
        return false;
    countOrder();
    return writeLog(isAlbum() ? OrderLog::Layout::Album : OrderLog::Layout::Plain);
}

// A sheet that was drawn before stays: the pictures of an order that goes on may be gone by now.
bool PlainPreparation::makeSheet() {
    const DrivePath path = m_folder->filePath(SheetName(m_state.MisparHazmana, m_state.shemot.ser, u".jpp"_s));
    if (!m_there.isEmpty() && m_platform.files.fileExists(path))
        return true;
    const std::optional<Bitmap> drawn = drawSheet(isAlbum() ? SheetKind::Album : SheetKind::Plain, m_lines);
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

void PlainPreparation::packPicture(int index, PrintPacker& packer, Prints& prints) {
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
    pack(packer, {index, line.code, line.path}, [&] { return prints.next([this] { m_platform.pump.pump(); }); });
}

} // namespace lumora
