#include "app/StationCommands.h"

#include "app/UsualPlaces.h"
#include "common/HostFile.h"
#include "platform/line/PocoInternet.h"
#include "session/lab/LabFile.h"
#include "session/lab/LabKeys.h"
#include "station/KeptLog.h"
#include "station/StationCheck.h"
#include "station/SupportBundle.h"

#include <unistd.h>

#include <cstdio>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

void printLine(const CheckLine& line) {
    struct Look {
        const char* word;
        const char* colour; // of a terminal
    };
    static constexpr Look looks[] = {{"ok   ", "\033[32m"}, {"look ", "\033[33m"}, {"FAULT", "\033[1;31m"}};
    const Look& look = looks[static_cast<std::size_t>(line.state)];
    const bool coloured = ::isatty(STDOUT_FILENO) == 1;
    QString text = line.text;
    if (!line.advice.isEmpty())
        text += u" -> "_s + line.advice;
    std::printf("%s%s%s  %s: %s\n", coloured ? look.colour : "", look.word, coloured ? "\033[0m" : "",
                qPrintable(line.subject), qPrintable(text.replace(u'\n', u' ')));
    std::fflush(stdout);
}

} // namespace

int checkStation(const ProgramOptions& options, bool writes) {
    const std::optional<HostPath> labFile = usedLabFile(options);
    const LabFileReading lab = labFile ? ReadLabFile(*labFile) : LabFileReading();
    PocoInternet line({}, lab.deployment.ftpType, lab.deployment.encryption);
    StationCheck check(lab, usedDataFolder(options, lab.deployment), doorProgram(), line, printLine);
    const bool good = check.run(labFile.value_or(HostPath()),
                                writes ? StationCheck::Server::IsWritten : StationCheck::Server::IsRead);
    return good ? 0 : 1;
}

int writeSupportBundle(const ProgramOptions& options, const HostPath& target) {
    const std::optional<HostPath> labFile = usedLabFile(options);
    const LabFileReading lab = labFile ? ReadLabFile(*labFile) : LabFileReading();
    const SupportBundle bundle(labFile.value_or(HostPath()), usedDataFolder(options, lab.deployment),
                               KeptLog::usualPath());
    const Result<SupportBundle::Log> written = bundle.write(target);
    if (!written) {
        std::fprintf(stderr, "lumora: %s\n", qPrintable(written.failure().message));
        return 1;
    }
    std::printf("%s is ready to be sent. It holds no customer's name and no password.\n", qPrintable(toText(target)));
    if (*written == SupportBundle::Log::Held)
        return 0;
    if (!lab.deployment.KeepLog)
        std::puts("There is no log in it: the lab's file has [Log] Keep = no.");
    else
        std::puts("There is no log in it. A kiosk's is in the journal, which not every user may read: "
                  "sudo -u lumora-kiosk -g systemd-journal lumora --support FILE.zip");
    return 0;
}

int printLabKeys() {
    QString section;
    for (const LabKey& key : labKeys()) {
        if (key.section != section)
            std::printf("%s[%s]\n", section.isEmpty() ? "" : "\n", qPrintable(key.section));
        section = key.section;
        std::printf("%s: %s\n", qPrintable(key.name), qPrintable(key.allowed));
    }
    return 0;
}

} // namespace lumora
