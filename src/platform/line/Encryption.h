#pragma once

#include "common/Result.h"

#include <QString>

#include <optional>

namespace lumora {

// How the line to the FTP server is encrypted: not at all, behind AUTH TLS, or from its first byte on.
enum class FtpTls { None, Explicit, Implicit };

struct LineEncryption {
    FtpTls ftp = FtpTls::None;
    // A PEM file on this machine with certificates that are believed beside those of its authorities; empty: none.
    QString authorities;
    bool operator==(const LineEncryption&) const = default;
};

// Why nothing was sent over a line that was to be encrypted.
enum class TlsFault {
    WrongHost,
    Expired,
    NotYetValid,
    SelfSigned,
    UnknownAuthority,
    NotTrusted,       // for another reason
    NoAuthorities,    // the file of authorities can't be read
    NotOffered,       // the server speaks in plain text alone
    TooOld,           // below TLS 1.2
    DataNotEncrypted, // PROT P is refused
};

// The words for whoever looks after the machine.
QString tlsWords(TlsFault fault);
Failure tlsFailure(TlsFault fault, const QString& host, const QString& detail);
// The fault that a failure of the line was made from.
std::optional<TlsFault> tlsFaultOf(const Failure& failure);

} // namespace lumora
