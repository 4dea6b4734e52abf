#include "order/OrderDetailsReader.h"

#include "common/FixedText.h"
#include "common/ListOutput.h"
#include "platform/files/Files.h"
#include "session/SessionState.h"

#include <array>
#include <cmath>
#include <utility>

namespace lumora {

namespace {

using Field = std::pair<QString, QString OrderDetails::*>;

const std::array<Field, 8>& textFields() {
    static const std::array<Field, 8> fields = {{
        {QStringLiteral("Shemot.n1"), &OrderDetails::n1},
        {QStringLiteral("Shemot.n2"), &OrderDetails::n2},
        {QStringLiteral("Shemot.ppr"), &OrderDetails::ppr},
        {QStringLiteral("Shemot.Hearot"), &OrderDetails::Hearot},
        {QStringLiteral("Shemot.Mail"), &OrderDetails::Mail},
        {QStringLiteral("Shemot.FillFit"), &OrderDetails::FillFit},
        {QStringLiteral("Shemot.maat"), &OrderDetails::maat},
        {QStringLiteral("Shemot.Bord"), &OrderDetails::Bord},
    }};
    return fields;
}

// An album tells these under names of its own.
const std::array<Field, 3>& albumFields() {
    static const std::array<Field, 3> fields = {{
        {QStringLiteral("ShemZalam"), &OrderDetails::n1},
        {QStringLiteral("GodelLBM"), &OrderDetails::ppr},
        {QStringLiteral("MailZalam"), &OrderDetails::Mail},
    }};
    return fields;
}

void setAll(OrderDetails& details, const QString& text) {
    for (const auto& [key, field] : textFields())
        details.*field = text;
    details.TotalPics = 0;
}

template <std::size_t N>
void take(const std::array<Field, N>& fields, const ListOutputEntry& entry, OrderDetails& details) {
    for (const auto& [key, field] : fields) {
        if (entry.key == key)
            details.*field = entry.value;
    }
}

Result<QByteArray> logBytes(const Files& files, const QString& path) {
    return files.fileExists(path) ? files.read(path) : Result<QByteArray>(Failure{Failure::Kind::NotFound, path});
}

} // namespace

void ReadOrderDetails(const Files& files, const QString& path, OrderDetails& details) {
    const auto bytes = logBytes(files, path);
    if (!bytes) {
        setAll(details, QStringLiteral("NO details"));
        return;
    }
    for (const ListOutputEntry& entry : ReadListOutput(*bytes)) {
        if (entry.key == QStringLiteral("Shemot.TotalPics"))
            details.TotalPics = Val16(entry.value);
        else
            take(textFields(), entry, details);
    }
}

void ReadResentDetails(const Files& files, const QString& path, OrderDetails& details) {
    setAll(details, {});
    ReadOrderDetails(files, path, details);
    const auto bytes = logBytes(files, path);
    if (!bytes)
        return;
    for (const ListOutputEntry& entry : ReadListOutput(*bytes)) {
        if (entry.key == QStringLiteral("TotalPics"))
            details.TotalPics = Val16(entry.value);
        else
            take(albumFields(), entry, details);
    }
}

std::int16_t CopiesCount(const QStringList& leafNames) {
    double total = 0;
    for (const QString& name : leafNames) {
        if (!name.endsWith(QStringLiteral("txt")))
            total += std::floor(Val(name.left(2)));
    }
    return HoldIn16Bits(total);
}

} // namespace lumora
