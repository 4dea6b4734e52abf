#include "desk/FolderTrace.h"

#include "common/HostFile.h"

#include <QByteArray>
#include <QCryptographicHash>

#include <sys/stat.h>

#include <algorithm>
#include <string>
#include <vector>

namespace lumora {

using namespace Qt::StringLiterals;
namespace fs = std::filesystem;

Result<QString> folderTrace(const fs::path& folder) {
    std::vector<std::string> lines;
    std::error_code error;
    fs::directory_iterator at(folder, error);
    for (const fs::directory_iterator end; !error && at != end; at.increment(error)) {
        struct stat status {};
        if (::stat(at->path().c_str(), &status) != 0)
            continue;
        const auto time = [](const timespec& moment) {
            return ' ' + std::to_string(moment.tv_sec) + '.' + std::to_string(moment.tv_nsec);
        };
        lines.push_back(at->path().filename().native() + '/' + std::to_string(status.st_size) + time(status.st_mtim) +
                        time(status.st_ctim));
    }
    if (error)
        return fileFailure(folder, u"can't be listed"_s, error.value());
    std::sort(lines.begin(), lines.end());
    QCryptographicHash hash(QCryptographicHash::Sha1);
    for (const std::string& line : lines)
        hash.addData(QByteArrayView(line.data(), static_cast<qsizetype>(line.size() + 1)));
    return QString::fromLatin1(hash.result().toHex());
}

} // namespace lumora
