#pragma once

#include "common/StationLog.h"
#include "platform/files/HostPath.h"
#include "station/LogFile.h"

namespace lumora {

// The log of a station whose lab has [Log] Keep. Where systemd keeps what the program writes on standard error it goes
// there, else into a file of at most 5 MB with its forerunner.
class KeptLog : public StationLog {
public:
    // $XDG_STATE_HOME/lumora/lumora.log, or ~/.local/state/lumora/lumora.log.
    static HostPath usualPath();

    explicit KeptLog(const HostPath& path = usualPath());
    ~KeptLog() override;
    KeptLog(const KeptLog&) = delete;
    KeptLog& operator=(const KeptLog&) = delete;

    void write(const QString& line) override;
    bool isStandardError() const override { return m_standardError; }

private:
    LogFile m_file;
    bool m_standardError;
    bool m_failed = false; // told once
};

} // namespace lumora
