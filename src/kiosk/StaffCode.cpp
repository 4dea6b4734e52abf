#include "kiosk/StaffCode.h"

#include "common/ListOutput.h"
#include "common/Warning.h"
#include "platform/Machine.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"
#include "session/Workspace.h"

#include <QRandomGenerator>

#include <algorithm>

#include <openssl/crypto.h>
#include <openssl/evp.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int usualIterations = 300000;
constexpr int saltBytes = 16;
constexpr int hashBytes = 32;
const QString wrongKey = u"Wrong"_s;

bool isEqual(const QByteArray& a, const QByteArray& b) {
    return a.size() == b.size() && CRYPTO_memcmp(a.data(), b.data(), static_cast<std::size_t>(a.size())) == 0;
}

QByteArray hashOf(const QByteArray& code, const QByteArray& salt, int iterations) {
    QByteArray hash(hashBytes, Qt::Uninitialized);
    const int made =
        PKCS5_PBKDF2_HMAC(code.data(), static_cast<int>(code.size()),
                          reinterpret_cast<const unsigned char*>(salt.data()), static_cast<int>(salt.size()),
                          iterations, EVP_sha256(), hashBytes, reinterpret_cast<unsigned char*>(hash.data()));
    return made == 1 ? hash : QByteArray();
}

} // namespace

QString StaffCodeLine(const QString& code, const QByteArray& salt, int iterations) {
    const QByteArray hash = hashOf(code.toUtf8(), salt, iterations);
    return u"%1:%2:%3"_s.arg(iterations).arg(QLatin1StringView(salt.toHex()), QLatin1StringView(hash.toHex()));
}

QString NewStaffCodeLine(const QString& code) {
    QByteArray salt(saltBytes, Qt::Uninitialized);
    for (char& byte : salt)
        byte = static_cast<char>(QRandomGenerator::system()->generate());
    return StaffCodeLine(code, salt, usualIterations);
}

bool IsStaffCode(const QString& code) {
    return code.size() >= shortestStaffCode && code.size() <= longestStaffCode &&
           std::all_of(code.begin(), code.end(), [](QChar digit) { return digit >= u'0' && digit <= u'9'; });
}

StaffCode::StaffCode(const SessionState& state, const Files& files, const Clock& clock)
    : m_state(state)
    , m_files(files)
    , m_clock(clock)
    , m_freeFrom(clock.running() + penalty) {}

StaffCode::Answer StaffCode::give(const QString& code) {
    if (m_wrong < 0)
        m_wrong = stored();
    if (secondsToWait() > 0)
        return Answer::TooSoon;
    keep(m_wrong + 1);
    const QStringList line = m_state.kiosk.code.split(u':');
    const bool right = line.size() == 3 &&
                       isEqual(StaffCodeLine(code, QByteArray::fromHex(line[1].toLatin1()), line[0].toInt()).toLatin1(),
                               m_state.kiosk.code.toLatin1());
    if (right)
        keep(0);
    m_freeFrom = m_clock.running() + penalty;
    return right ? Answer::Right : Answer::Wrong;
}

int StaffCode::secondsToWait() const {
    const int wrong = m_wrong < 0 ? stored() : m_wrong;
    const auto left = std::chrono::ceil<std::chrono::seconds>(m_freeFrom - m_clock.running());
    return wrong > freeTries ? static_cast<int>(std::max<std::chrono::seconds::rep>(left.count(), 0)) : 0;
}

DrivePath StaffCode::path() const {
    return WorkspacePaths::counter(m_state).folder() / u"kiosk.txt";
}

// A file that can't be understood lets nobody try faster.
int StaffCode::stored() const {
    if (!m_files.fileExists(path()))
        return 0;
    const Result<QByteArray> bytes = m_files.read(path());
    const QList<ListOutputEntry> entries = bytes ? ReadListOutput(*bytes) : QList<ListOutputEntry>();
    bool isNumber = false;
    const int wrong =
        entries.size() == 1 && entries.first().key == wrongKey ? entries.first().value.toInt(&isNumber) : 0;
    return isNumber && wrong >= 0 ? wrong : freeTries + 1;
}

void StaffCode::keep(int wrong) {
    m_wrong = wrong;
    ListOutput output;
    output.text(wrongKey).number(wrong).endLine();
    Result<void> kept = m_files.makeFolder(path().folder());
    if (kept)
        kept = m_files.writeWhole(path(), output.bytes());
    if (!kept)
        writeWarning(u"a try of the staff's code can't be kept: %1"_s.arg(kept.failure().message));
}

} // namespace lumora
