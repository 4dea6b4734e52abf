#include "order/OrderCheck.h"

#include "common/FixedText.h"
#include "common/ListOutput.h"
#include "imaging/files/PictureFile.h"
#include "order/OrderItem.h"
#include "order/OrderNames.h"
#include "order/OrderTail.h"
#include "order/PrintFileName.h"
#include "platform/files/HostPath.h"

#include <QFile>
#include <QMultiMap>
#include <QTemporaryFile>

#include <algorithm>
#include <optional>

namespace lumora {
namespace fs = std::filesystem;
namespace {

// What the log of an order says, of either print form and of the album form.
struct ReadLog {
    QString order;
    QString timeOfJob;
    int optint = 0;
    OrderTail tail; // as the print files should carry it
    int total = 0;
    std::optional<int> failedCount; // the edited form does not count
    QStringList failed;
    QStringList items;
    bool edited = false;

    OrderItem split(const QString& item) const {
        return OrderItem::split(item, edited ? OrderItem::Form::Edited : OrderItem::Form::Plain);
    }
};

ReadLog readLog(const QByteArray& bytes) {
    ReadLog log;
    bool first = true;
    for (const ListOutputEntry& entry : ReadListOutput(bytes)) {
        if (first)
            log.edited = entry.key == QLatin1String("KeSherLaSharat = ");
        first = false;
        const QString key = entry.key.startsWith(QLatin1String("Shemot.")) ? entry.key.mid(7) : entry.key;
        if (key == QLatin1String("Hazmana"))
            log.order = entry.value;
        else if (key == QLatin1String("TimeOfJob"))
            log.timeOfJob = entry.value;
        else if (key == QLatin1String("Optint"))
            log.optint = Val16(entry.value);
        else if (key == QLatin1String("Option"))
            log.optint = 2; // the edited form always says 5
        else if (key == QLatin1String("n1"))
            log.tail.name = entry.value;
        else if (key == QLatin1String("n2"))
            log.tail.telephone = entry.value;
        else if (key == QLatin1String("ser"))
            log.tail.serial = entry.value;
        else if (key == QLatin1String("TotalPics"))
            log.total = Val16(entry.value);
        else if (key == QLatin1String("-----------Total Failed"))
            log.failedCount = Val16(entry.value);
        else if (key == QLatin1String("fail_") || key == QLatin1String("Failed  "))
            log.failed += entry.value;
        else if (key == QLatin1String("Shoora"))
            log.items += entry.value;
    }
    // The album form carries no time of its own: the order's name is that and the number behind a "^".
    log.tail.orderNumber = log.order.mid(log.order.lastIndexOf(u'^') + 1);
    log.tail.totalPics = QString::number(log.total);
    return log;
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
    Check(const fs::path& folder, PrintFileShape shape, ReadLog log)
        : m_folder(folder)
        , m_shape(shape)
        , m_log(std::move(log)) {}

    OrderFindings run(const QString& folderName) {
        m_report.order = m_log.order;
        m_report.items = static_cast<int>(m_log.items.size());
        m_report.failed = static_cast<int>(m_log.failed.size());
        if (folderName != m_log.order && folderName != m_log.order + u'P')
            fault(QStringLiteral("the log is that of order \"%1\"").arg(m_log.order));
        checkTotals();
        checkSheet();
        for (const QString& name : namesWith(m_folder, ".jpp")) {
            if (!IsSheet(name))
                checkPrintFile(name);
        }
        checkEveryItemIsThere();
        return m_report;
    }

private:
    void fault(const QString& text) { m_report.faults += text; }

    void checkTotals() {
        m_report.copies = OrderItem::copiesOf(m_log.items);
        if (m_report.copies != m_log.total)
            fault(
                QStringLiteral("the log's total is %1, its lines add up to %2").arg(m_log.total).arg(m_report.copies));
        if (m_log.failedCount && *m_log.failedCount != m_log.failed.size())
            fault(QStringLiteral("the log counts %1 failed pictures and names %2")
                      .arg(*m_log.failedCount)
                      .arg(m_log.failed.size()));
    }

    // An edited order may have its sheet under a plain ending, instead or beside.
    void checkSheet() {
        const QString stem = u'!' + m_log.tail.orderNumber + u'_' + m_log.tail.serial;
        const QString plain = stem + QStringLiteral(".jpg");
        const bool hasPlain = m_log.edited && has(plain);
        if (hasPlain)
            checkSheet(plain);
        if (!hasPlain || has(stem + QStringLiteral(".jpp")))
            checkSheet(stem + QStringLiteral(".jpp"));
    }

    bool has(const QString& name) const {
        std::error_code error;
        return fs::exists(m_folder / toHostPath(name), error);
    }

    void checkSheet(const QString& name) {
        const Result<QByteArray> sheet = readHostFile(m_folder / toHostPath(name));
        const Result<void> whole = sheet ? checkWholeJpeg(*sheet) : Result<void>(sheet.failure());
        if (!whole)
            fault(QStringLiteral("%1: %2").arg(name, whole.failure().message));
    }

    void checkPrintFile(const QString& name) {
        const Result<QByteArray> bytes = readHostFile(m_folder / toHostPath(name));
        const Result<PrintFileContent> content =
            bytes ? readPrintFile(*bytes, m_shape) : Result<PrintFileContent>(bytes.failure());
        const Result<void> whole = content ? checkWholeJpeg(content->picture) : Result<void>(content.failure());
        if (whole)
            ++m_report.prints;
        else
            fault(QStringLiteral("%1: %2").arg(name, whole.failure().message));
        if (content)
            checkTail(name, content->tail);
        checkName(name);
    }

    void checkTail(const QString& name, const QByteArray& bytes) {
        const std::optional<OrderTail> tail = OrderTail::parse(bytes);
        if (!tail)
            return; // a print file may go without
        // An album's log holds no customer.
        const bool customerKnown = m_log.optint != 10;
        const auto compare = [&](const char* what, const QString& found, const QString& logged, int width) {
            QString wanted = LeftField(logged, width);
            while (wanted.endsWith(u' '))
                wanted.chop(1);
            if (found != wanted)
                fault(QStringLiteral("%1: the tail's %2 is \"%3\", the log has \"%4\"")
                          .arg(name, QLatin1String(what), found, wanted));
        };
        if (customerKnown) {
            compare("telephone", tail->telephone, m_log.tail.telephone, 10);
            compare("name", tail->name, m_log.tail.name, 10);
        }
        compare("total", tail->totalPics, m_log.tail.totalPics, 3);
        compare("order number", tail->orderNumber, m_log.tail.orderNumber, 3);
        compare("serial", tail->serial, m_log.tail.serial, 4);
    }

    void checkName(const QString& name) {
        const std::optional<PrintFileName> parts = PrintFileName::parse(name);
        if (!parts) {
            fault(QStringLiteral("%1: not the name of a print file").arg(name));
            return;
        }
        // The place in the order has four digits only, so that several lines may be meant.
        bool found = false;
        for (qsizetype i = parts->index; i < m_log.items.size() && !found; i += 10000) {
            const OrderItem item = m_log.split(m_log.items[i]);
            found = item.code == parts->code && PrintBaseName(item.path) == parts->baseName;
            if (found)
                m_made.insert(static_cast<int>(i), name);
        }
        if (!found)
            fault(QStringLiteral("%1: no line of the log has this place, code and picture").arg(name));
        if (parts->optint != m_log.optint)
            fault(QStringLiteral("%1: the kind of order is %2, the log has %3")
                      .arg(name)
                      .arg(parts->optint)
                      .arg(m_log.optint));
    }

    void checkEveryItemIsThere() {
        for (qsizetype i = 0; i < m_log.items.size(); ++i) {
            const OrderItem item = m_log.split(m_log.items[i]);
            const bool excused = !item.hasUsableName() || m_log.failed.contains(item.path);
            if (!m_made.contains(static_cast<int>(i)) && !excused)
                fault(QStringLiteral("line %1 of the basket (%2) has no print file and is not named as failed")
                          .arg(i)
                          .arg(item.path));
        }
    }

    const fs::path m_folder;
    const PrintFileShape m_shape;
    const ReadLog m_log;
    QMultiMap<int, QString> m_made;
    OrderFindings m_report;
};

} // namespace

Result<QByteArray> readHostFile(const fs::path& path) {
    QFile file(toText(path));
    if (!file.open(QIODevice::ReadOnly)) {
        const auto kind = file.exists() ? Failure::Kind::AccessDenied : Failure::Kind::NotFound;
        return Failure{kind, QStringLiteral("%1: %2").arg(toText(path), file.errorString())};
    }
    QByteArray bytes = file.readAll();
    if (file.error() != QFileDevice::NoError)
        return Failure{Failure::Kind::Other, QStringLiteral("%1: %2").arg(toText(path), file.errorString())};
    return bytes;
}

Result<void> checkWholeJpeg(const QByteArray& bytes) {
    if (!bytes.startsWith("\xFF\xD8"))
        return Failure{Failure::Kind::Damaged, QStringLiteral("what it holds is no JPEG picture")};
    QTemporaryFile file;
    if (!file.open() || file.write(bytes) != bytes.size() || !file.flush())
        return Failure{Failure::Kind::Other, QStringLiteral("%1: %2").arg(file.fileName(), file.errorString())};
    const Result<Bitmap> picture = loadPicture(toHostPath(file.fileName()));
    if (!picture)
        return Failure{Failure::Kind::Damaged, QStringLiteral("its picture is damaged or cut short")};
    return {};
}

Result<OrderFindings> checkOrderFolder(const fs::path& folder, PrintFileShape shape) {
    std::error_code error;
    if (!fs::is_directory(folder, error))
        return Failure{Failure::Kind::NotFound, QStringLiteral("%1: no such folder").arg(toText(folder))};
    const QString name = toText(fs::weakly_canonical(folder, error).filename());
    QStringList logs = namesWith(folder, ".txt");
    if (logs.contains(name + QStringLiteral(".txt")))
        logs = {name + QStringLiteral(".txt")};
    if (logs.size() != 1)
        return Failure{Failure::Kind::NotFound,
                       logs.isEmpty()
                           ? QStringLiteral("%1: holds no order log").arg(toText(folder))
                           : QStringLiteral("%1: holds several logs, none of its own name").arg(toText(folder))};
    const Result<QByteArray> bytes = readHostFile(folder / toHostPath(logs[0]));
    if (!bytes)
        return bytes.failure();
    ReadLog log = readLog(*bytes);
    if (log.order.isEmpty())
        return Failure{Failure::Kind::Damaged, QStringLiteral("%1: no order log").arg(logs[0])};
    return Check(folder, shape, std::move(log)).run(name);
}

} // namespace lumora
