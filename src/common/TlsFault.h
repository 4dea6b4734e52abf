#pragma once

namespace lumora {

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

} // namespace lumora
