#include "order/OrderCheck.h"

#include "common/FixedText.h"
#include "imaging/files/PictureFile.h"
#include "order/OrderLog.h"
#include "order/OrderNames.h"
#include "order/OrderTail.h"
#include "order/PrintFileName.h"
#include "order/TailTelephone.h"
#include "platform/files/HostPath.h"

#include <QFile>
#include <QMultiMap>
#include <QTemporaryFile>

#include <algorithm>
#include <optional>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;
namespace {

// The tail that the log's order gives its print files.
OrderTail tailOf(const OrderLog& log) {
    return {log.shemot.n2,
            log.shemot.n1,
            QString::number(log.shemot.TotalPics),
            OrderNumberOf(log.Hazmana),
            log.shemot.ser,
            {}};
}

QStringList namesWith(const fs::path& folder, const char* ending) {
    QStringList names;
    std::error_code error;
    for (fs::directory_iterator at(folder, error), end; !error && at != end; at.increment(error)) {
        const QString name = toText(at->path().filename());
        if (!name.startsWith(u'.') && name.endsWith(QLatin1String(ending), Qt::CaseInsensitive))
            names += name;
    }
    names.sort();
    return names;
}

class Check {
public:
    Check(const fs::path& folder, PrintFileShape shape, OrderLog log)
        : m_folder(folder)
        , m_shape(shape)
        , m_log(std::move(log))
        , m_tail(tailOf(m_log)) {}

    OrderFindings run(const QString& folderName) {
        m_report.order = m_log.Hazmana;
        m_report.items = static_cast<int>(m_log.items.size());
        m_report.failed = static_cast<int>(m_log.failed.size());
        if (folderName != m_log.Hazmana && folderName != m_log.Hazmana + u'P')
            fault(u"the log is that of order \"%1\""_s.arg(m_log.Hazmana));
        checkTotals();
        checkPaperLetters();
        checkSheet();
        for (const QString& name : namesWith(m_folder, ".jpp")) {
            if (!IsSheet(name))
                checkPrintFile(name);
        }
        checkEveryItemIsThere();
        if (m_report.prints == 0)
            fault(u"no print file of the order can be read"_s);
        return m_report;
    }

private:
    void fault(const QString& text) { m_report.faults += text; }

    void checkTotals() {
        m_report.copies = sumOfCopies(m_log.items, CopiesIn::BasketLines);
        if (m_report.copies != m_log.shemot.TotalPics)
            fault(u"the log's total is %1, its lines add up to %2"_s.arg(m_log.shemot.TotalPics).arg(m_report.copies));
        if (m_log.countOfFailed && *m_log.countOfFailed != m_log.failed.size())
            fault(
                u"the log counts %1 failed pictures and names %2"_s.arg(*m_log.countOfFailed).arg(m_log.failed.size()));
    }

    void checkPaperLetters() {
        const auto isBlank = [](const QString& item) { return PrintCode::paperOf(item) == u' '; };
        if (const auto blank = std::count_if(m_log.items.cbegin(), m_log.items.cend(), isBlank))
            fault(u"%1 lines of the basket have no paper letter"_s.arg(blank));
    }

    // The sheet of an edited order may end in .jpg, instead of .jpp or besides it.
    void checkSheet() {
        const auto named = [this](const QString& ending) {
            return SheetName(m_tail.orderNumber, m_tail.serial, ending);
        };
        const QString plain = named(u".jpg"_s);
        const QString sheet = named(u".jpp"_s);
        const bool hasPlain = m_log.layout == OrderLog::Layout::Edited && has(plain);
        if (hasPlain)
            checkSheet(plain);
        if (!hasPlain || has(sheet))
            checkSheet(sheet);
    }

    bool has(const QString& name) const {
        std::error_code error;
        return fs::exists(m_folder / toHostPath(name), error);
    }

    void checkSheet(const QString& name) {
        if (!has(name)) {
            fault(u"%1: the order sheet is missing"_s.arg(name));
            return;
        }
        const Result<QByteArray> sheet = readHostFile(m_folder / toHostPath(name));
        const Result<void> whole = sheet ? checkWholeJpeg(*sheet) : Result<void>(sheet.failure());
        if (!whole)
            fault(u"%1: %2"_s.arg(name, whole.failure().message));
    }

    void checkPrintFile(const QString& name) {
        const Result<QByteArray> bytes = readHostFile(m_folder / toHostPath(name));
        const Result<PrintFileContent> content =
            bytes ? readPrintFile(*bytes, m_shape) : Result<PrintFileContent>(bytes.failure());
        const Result<void> whole = content ? checkWholeJpeg(content->picture) : Result<void>(content.failure());
        if (whole)
            ++m_report.prints;
        else
            fault(u"%1: %2"_s.arg(name, whole.failure().message));
        if (content)
            checkTail(name, content->tail);
        checkName(name);
    }

    void checkTail(const QString& name, const QByteArray& bytes) {
        const std::optional<OrderTail> tail = OrderTail::parse(bytes);
        if (!tail)
            return; // a print file may have no tail
        // The log of an album names no customer.
        const bool customerKnown = m_log.Optint != OrderKind::Album;
        const auto compare = [&](const char* what, const QString& found, const QString& logged, int width) {
            QString wanted = LeftField(logged, width);
            while (wanted.endsWith(u' '))
                wanted.chop(1);
            if (found != wanted)
                fault(
                    u"%1: the tail's %2 is \"%3\", the log has \"%4\""_s.arg(name, QLatin1String(what), found, wanted));
        };
        if (customerKnown) {
            // With Careful the tail has a long number without its hyphens.
            if (tail->telephone != LeftField(TailTelephone::squeezed(m_tail.telephone), TailTelephone::width).trimmed())
                compare("telephone", tail->telephone, m_tail.telephone, 10);
            compare("name", tail->name, m_tail.name, 10);
        }
        compare("total", tail->totalPics, m_tail.totalPics, 3);
        compare("order number", tail->orderNumber, m_tail.orderNumber, 3);
        compare("serial", tail->serial, m_tail.serial, 4);
    }

    void checkName(const QString& name) {
        const std::optional<PrintFileName> parts = PrintFileName::parse(name);
        if (!parts) {
            fault(u"%1: not the name of a print file"_s.arg(name));
            return;
        }
        // The name holds only the last four digits of the line's number, so each line 10000 further on is tried too.
        bool found = false;
        for (qsizetype i = parts->index; i < m_log.items.size() && !found; i += 10000) {
            const BasketLine item = m_log.line(i);
            found = item.code == parts->code && PrintBaseName(item.path) == parts->baseName;
            if (found)
                m_made.insert(static_cast<int>(i), name);
        }
        if (!found)
            fault(u"%1: no line of the log has this place, code and picture"_s.arg(name));
        if (parts->optint != static_cast<int>(m_log.Optint))
            fault(u"%1: the kind of order is %2, the log has %3"_s.arg(name)
                      .arg(parts->optint)
                      .arg(static_cast<int>(m_log.Optint)));
    }

    void checkEveryItemIsThere() {
        for (qsizetype i = 0; i < m_log.items.size(); ++i) {
            const BasketLine item = m_log.line(i);
            const bool excused = !item.hasUsableName() || m_log.failed.contains(item.path.text());
            if (!m_made.contains(static_cast<int>(i)) && !excused)
                fault(u"line %1 of the basket (%2) has no print file and is not named as failed"_s.arg(i).arg(
                    item.path.text()));
        }
    }

    const fs::path m_folder;
    const PrintFileShape m_shape;
    const OrderLog m_log;
    const OrderTail m_tail;
    QMultiMap<int, QString> m_made;
    OrderFindings m_report;
};

} // namespace

Result<QByteArray> readHostFile(const fs::path& path) {
    QFile file(toText(path));
    if (!file.open(QIODevice::ReadOnly)) {
        const auto kind = file.exists() ? Failure::Kind::AccessDenied : Failure::Kind::NotFound;
        return Failure{kind, u"%1: %2"_s.arg(toText(path), file.errorString())};
    }
    QByteArray bytes = file.readAll();
    if (file.error() != QFileDevice::NoError)
        return Failure{Failure::Kind::Other, u"%1: %2"_s.arg(toText(path), file.errorString())};
    return bytes;
}

Result<void> checkWholeJpeg(const QByteArray& bytes) {
    if (!bytes.startsWith("\xFF\xD8"))
        return Failure{Failure::Kind::Damaged, u"what it holds is no JPEG picture"_s};
    QTemporaryFile file;
    if (!file.open() || file.write(bytes) != bytes.size() || !file.flush())
        return Failure{Failure::Kind::Other, u"%1: %2"_s.arg(file.fileName(), file.errorString())};
    const Result<Bitmap> picture = loadPicture(toHostPath(file.fileName()));
    if (!picture)
        return Failure{Failure::Kind::Damaged, u"its picture is damaged or cut short"_s};
    return {};
}

Result<OrderFindings> checkOrderFolder(const fs::path& folder, PrintFileShape shape) {
    std::error_code error;
    if (!fs::is_directory(folder, error))
        return Failure{Failure::Kind::NotFound, u"%1: no such folder"_s.arg(toText(folder))};
    const QString name = toText(fs::weakly_canonical(folder, error).filename());
    QStringList logs = namesWith(folder, ".txt");
    // The log of an order in pieces may lack the "P" of its folder; a web server's lists are texts too.
    const QString whole = TravelsInPieces(name) ? name.chopped(1) : name;
    for (const QString& log : {name + u".txt"_s, whole + u".txt"_s}) {
        if (logs.contains(log))
            logs = {log};
    }
    if (logs.size() != 1)
        return Failure{Failure::Kind::NotFound,
                       logs.isEmpty() ? u"%1: holds no order log"_s.arg(toText(folder))
                                      : u"%1: holds several logs, none of its own name"_s.arg(toText(folder))};
    const Result<QByteArray> bytes = readHostFile(folder / toHostPath(logs[0]));
    if (!bytes)
        return bytes.failure();
    OrderLog log;
    log.read(*bytes);
    if (log.Hazmana.isEmpty())
        return Failure{Failure::Kind::Damaged, u"%1: no order log"_s.arg(logs[0])};
    return Check(folder, shape, std::move(log)).run(name);
}

} // namespace lumora
