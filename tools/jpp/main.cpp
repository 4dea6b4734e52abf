// Tool for the lab: shows, unpacks and checks print files and order folders, and takes orders in.

#include "DeskCalls.h"
#include "order/OrderCheck.h"
#include "order/OrderTail.h"
#include "order/PrintFileName.h"
#include "platform/files/HostPath.h"

#include <QCommandLineParser>
#include <QCoreApplication>
#include <QSaveFile>
#include <QTextStream>

using namespace Qt::StringLiterals;

using namespace lumora;

namespace {

enum ExitCode { allWell = 0, faultFound = 1, notUnderstood = 2 };

QTextStream& out() {
    static QTextStream stream(stdout);
    return stream;
}

QTextStream& err() {
    static QTextStream stream(stderr);
    return stream;
}

Result<PrintFileContent> readFile(const QString& path, PrintFileShape shape) {
    const Result<QByteArray> bytes = readHostFile(toHostPath(path));
    if (!bytes)
        return bytes.failure();
    Result<PrintFileContent> content = readPrintFile(*bytes, shape);
    if (!content)
        return Failure{content.failure().kind, path + u": "_s + content.failure().message};
    return content;
}

int info(const QStringList& files, PrintFileShape shape) {
    int code = allWell;
    for (const QString& path : files) {
        // A picture with the pieces' numbers inside may decode, so that only the pieces tell a print file from a sheet.
        const Result<PrintFileContent> content = readFile(path, shape);
        if (!content) {
            const Result<QByteArray> bytes = readHostFile(toHostPath(path));
            if (bytes && checkWholeJpeg(*bytes)) {
                out() << path << "\n  a plain picture, as an order sheet is: " << bytes->size() << " bytes" << Qt::endl;
            } else {
                err() << content.failure().message << Qt::endl;
                code = faultFound;
            }
            continue;
        }
        out() << path << '\n';
        if (const auto name = PrintFileName::parse(toText(toHostPath(path).filename())))
            out() << "  code          " << name->code << "  (" << name->copies() << " copies)\n"
                  << "  place         " << name->index << '\n'
                  << "  kind          " << name->optint << '\n'
                  << "  picture name  " << name->baseName << '\n';
        out() << "  picture       " << content->picture.size() << " bytes\n"
              << "  pieces        " << shape.chunks << " of " << content->piece << " bytes, " << content->remainder
              << " behind\n"
              << "  tail          " << content->tail.size() << " bytes\n";
        if (const auto tail = OrderTail::parse(content->tail)) {
            out() << "    telephone   " << tail->telephone << '\n'
                  << "    name        " << tail->name << '\n'
                  << "    total       " << tail->totalPics << '\n'
                  << "    order       " << tail->orderNumber << '\n'
                  << "    serial      " << tail->serial << '\n';
            if (content->tail.size() == OrderTail::longWidth)
                out() << "    picture     " << tail->baseName << '\n';
        }
        if (const Result<void> whole = checkWholeJpeg(content->picture); !whole) {
            err() << path << ": " << whole.failure().message << Qt::endl;
            code = faultFound;
        }
        out().flush();
    }
    return code;
}

int unpack(const QString& source, const QString& target, PrintFileShape shape) {
    const Result<PrintFileContent> content = readFile(source, shape);
    if (!content) {
        err() << content.failure().message << Qt::endl;
        return faultFound;
    }
    QSaveFile file(target);
    if (!file.open(QIODevice::WriteOnly) || file.write(content->picture) != content->picture.size() || !file.commit()) {
        err() << target << ": " << file.errorString() << Qt::endl;
        return faultFound;
    }
    return allWell;
}

int check(const QStringList& folders, PrintFileShape shape) {
    int code = allWell;
    for (const QString& folder : folders) {
        const Result<OrderFindings> report = checkOrderFolder(toHostPath(folder), shape);
        if (!report) {
            err() << report.failure().message << Qt::endl;
            code = faultFound;
            continue;
        }
        for (const QString& fault : report->faults)
            err() << folder << ": " << fault << Qt::endl;
        if (!report->faults.isEmpty())
            code = faultFound;
        out() << "order " << report->order << ": " << report->items << " lines, " << report->copies << " copies, "
              << report->prints << " print files whole, " << report->failed << " pictures failed, "
              << report->faults.size() << " faults" << Qt::endl;
    }
    return code;
}

} // namespace

int main(int argc, char** argv) {
    QCoreApplication application(argc, argv);
    QCoreApplication::setApplicationName(u"lumora-jpp"_s);
    QCoreApplication::setApplicationVersion(QStringLiteral(LUMORA_VERSION));

    QCommandLineParser parser;
    parser.setApplicationDescription(
        u"Reads print files, and is the lab's desk.\n\n"
        u"  lumora-jpp info FILE...            what print files hold\n"
        u"  lumora-jpp unpack FILE OUT.jpg     the picture of a print file\n"
        u"  lumora-jpp check ORDER_FOLDER...   whether an order is whole\n"
        u"  lumora-jpp watch FOLDER --into HOTFOLDER\n"
        u"                                     takes in the orders that arrive in a folder\n"
        u"  lumora-jpp export ORDER_FOLDER... --into FOLDER\n"
        u"                                     the same with single orders, by hand\n"
        u"  lumora-jpp report FOLDER --from DAY --to DAY\n"
        u"                                     what watch has done: CSV and a page\n\n"
        u"Exit status: 0 all is well, 1 a file or an order is at fault, 2 the call is."_s);
    parser.addHelpOption();
    parser.addVersionOption();
    const QCommandLineOption base(u"base"_s, u"What the profile adds to the length of a piece (30)."_s, u"NUMBER"_s,
                                  u"30"_s);
    const QCommandLineOption chunks(u"chunks"_s, u"Pieces of a print file, 1 to 32767 (56)."_s, u"NUMBER"_s, u"56"_s);
    parser.addOptions({base, chunks});
    DeskCalls::addOptions(parser);
    parser.addPositionalArgument(u"command"_s, u"info, unpack, check, watch, export or report"_s);
    parser.addPositionalArgument(u"arguments"_s, u"as above"_s, u"ARGUMENT..."_s);
    if (!parser.parse(QCoreApplication::arguments())) {
        err() << parser.errorText() << Qt::endl;
        return notUnderstood;
    }
    if (parser.isSet(u"version"_s))
        parser.showVersion();
    if (parser.isSet(u"help"_s))
        parser.showHelp();

    bool baseOk = false;
    bool chunksOk = false;
    const PrintFileShape shape{parser.value(chunks).toInt(&chunksOk), parser.value(base).toInt(&baseOk)};
    if (!baseOk || !chunksOk || shape.chunks < 1 || shape.chunks > 32767) {
        err() << "--base takes a number, --chunks a number from 1 to 32767." << Qt::endl;
        return notUnderstood;
    }
    QStringList arguments = parser.positionalArguments();
    const QString command = arguments.isEmpty() ? QString() : arguments.takeFirst();
    if (command == QLatin1String("info") && !arguments.isEmpty())
        return info(arguments, shape);
    if (command == QLatin1String("unpack") && arguments.size() == 2)
        return unpack(arguments[0], arguments[1], shape);
    if (command == QLatin1String("check") && !arguments.isEmpty())
        return check(arguments, shape);
    const DeskCalls desk(parser, shape);
    if (command == QLatin1String("watch") && arguments.size() == 1)
        return desk.watch(arguments[0]);
    if (command == QLatin1String("export") && !arguments.isEmpty())
        return desk.exportOrders(arguments);
    if (command == QLatin1String("report") && arguments.size() == 1)
        return desk.report(arguments[0]);
    err() << parser.helpText() << Qt::flush;
    return notUnderstood;
}
