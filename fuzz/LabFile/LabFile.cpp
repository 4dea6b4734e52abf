#include "session/lab/LabFile.h"
#include "session/lab/ClientProfile.h"

#include <cstdint>
#include <cstdlib>

using namespace Qt::StringLiterals;

// The lab's file, which people edit by hand. Whatever it holds, a reading without errors gives a profile within its
// bounds.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const QByteArray bytes(reinterpret_cast<const char*>(data), static_cast<qsizetype>(size));
    const lumora::LabFileReading reading = lumora::ParseLabFile(bytes, u"lab.ini"_s);
    const lumora::ClientProfile& profile = reading.deployment.profile;
    if (profile.FtpFolder2.isEmpty() || profile.JppChunks < 1 || profile.JppChunks > 32767)
        std::abort();
    lumora::SessionState state;
    lumora::LoadDefaultProfile(state, reading.deployment);
    return 0;
}
