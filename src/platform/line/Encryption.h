#pragma once

#include "common/Result.h"

#include <QString>

namespace lumora {

// How the line to the FTP server is encrypted: not at all, behind AUTH TLS, or from its first byte on.
enum class FtpTls { None, Explicit, Implicit };

struct LineEncryption {
    FtpTls ftp = FtpTls::None;
    // A PEM file on this machine with certificates that are believed beside those of its authorities; empty: none.
    QString authorities;
    bool operator==(const LineEncryption&) const = default;
};

// The words for whoever looks after the machine.
QString tlsWords(TlsFault fault);
Failure tlsFailure(TlsFault fault, const QString& host, const QString& detail);

} // namespace lumora
