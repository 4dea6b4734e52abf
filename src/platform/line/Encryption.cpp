#include "platform/line/Encryption.h"

namespace lumora {

using namespace Qt::StringLiterals;

QString tlsWords(TlsFault fault) {
    switch (fault) {
    case TlsFault::WrongHost:
        return u"the server's certificate is for another host"_s;
    case TlsFault::Expired:
        return u"the server's certificate has expired"_s;
    case TlsFault::NotYetValid:
        return u"the server's certificate is not valid yet"_s;
    case TlsFault::SelfSigned:
        return u"the server has signed its certificate itself"_s;
    case TlsFault::UnknownAuthority:
        return u"nobody whom this machine knows has signed the server's certificate"_s;
    case TlsFault::NotTrusted:
        return u"the server's certificate is not good"_s;
    case TlsFault::NoAuthorities:
        return u"the file of authorities can't be read"_s;
    case TlsFault::NotOffered:
        return u"the server offers no encryption"_s;
    case TlsFault::TooOld:
        return u"the server offers only an encryption that is too old"_s;
    case TlsFault::DataNotEncrypted:
        return u"the server does not encrypt the files"_s;
    }
    return {};
}

Failure tlsFailure(TlsFault fault, const QString& host, const QString& detail) {
    const QString text = u"%1: %2"_s.arg(host, tlsWords(fault));
    return {Failure::Kind::Unsupported, detail.isEmpty() ? text : u"%1 (%2)"_s.arg(text, detail), false, fault};
}

} // namespace lumora
