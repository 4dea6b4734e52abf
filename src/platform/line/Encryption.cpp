#include "platform/line/Encryption.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

struct WordsOfFault {
    TlsFault fault;
    const char* words;
};

constexpr WordsOfFault faultWords[] = {
    {TlsFault::WrongHost, "the server's certificate is for another host"},
    {TlsFault::Expired, "the server's certificate has expired"},
    {TlsFault::NotYetValid, "the server's certificate is not valid yet"},
    {TlsFault::SelfSigned, "the server has signed its certificate itself"},
    {TlsFault::UnknownAuthority, "nobody whom this machine knows has signed the server's certificate"},
    {TlsFault::NotTrusted, "the server's certificate is not good"},
    {TlsFault::NoAuthorities, "the file of authorities can't be read"},
    {TlsFault::NotOffered, "the server offers no encryption"},
    {TlsFault::TooOld, "the server offers only an encryption that is too old"},
    {TlsFault::DataNotEncrypted, "the server does not encrypt the files"},
};

} // namespace

QString tlsWords(TlsFault fault) {
    for (const WordsOfFault& known : faultWords) {
        if (known.fault == fault)
            return QLatin1StringView(known.words);
    }
    return {};
}

Failure tlsFailure(TlsFault fault, const QString& host, const QString& detail) {
    const QString text = u"%1: %2"_s.arg(host, tlsWords(fault));
    return {Failure::Kind::Unsupported, detail.isEmpty() ? text : u"%1 (%2)"_s.arg(text, detail)};
}

std::optional<TlsFault> tlsFaultOf(const Failure& failure) {
    if (failure.kind != Failure::Kind::Unsupported)
        return std::nullopt;
    for (const WordsOfFault& known : faultWords) {
        if (failure.message.contains(u": "_s + QLatin1StringView(known.words)))
            return known.fault;
    }
    return std::nullopt;
}

} // namespace lumora
