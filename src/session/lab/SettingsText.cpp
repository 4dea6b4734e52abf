#include "session/lab/SettingsText.h"

#include "common/FixedText.h"
#include "session/SessionState.h"

namespace lumora {

namespace {

// The lab's site and all copies of the program agree on these two tables.
const QString plainAlphabet =
    QStringLiteral("abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ1234567890@*-_\\/+!. ^=");
const QString permutation =
    QStringLiteral("oC+U_Pqxd0ve67 I2DFg3A91VNlHp4ZzK5uOJmhk@nByiXrGL^EYfbR*c-Sa.\\Q!Ts/Mj=8wtW");

QString exchanged(const QString& text, const QString& from, const QString& to) {
    QString result;
    for (const QChar letter : text) {
        if (const qsizetype at = from.indexOf(letter); at >= 0)
            result += to[at];
    }
    return result;
}

QString piece(const QString& key, const QString& value) {
    return key + (value.isEmpty() ? QStringLiteral("0") : value) + u'^';
}

struct CardField {
    QString name;
    QString caption; // empty: no line in the list
};

const std::vector<CardField> cardFields = {
    {QStringLiteral("FileDtt"), QString()},
    {QStringLiteral("HaeemHaytaSisma"), QString()},
    {QStringLiteral("DayOfOrder"), QStringLiteral("  תאריך הזמנה  ")},
    {QStringLiteral("MisparHazmanaZo"), QStringLiteral(" מספר הזמנה ")},
    {QStringLiteral("ShemHamazmin"), QStringLiteral("  שם המזמין  ")},
    {QStringLiteral("MisparHakartis"), QStringLiteral("   מספר כרטיס   ")},
    {QStringLiteral("GodeDaf"), QStringLiteral("   גודל דף   ")},
    {QStringLiteral("TotalPicsBeHazmanaZo"), QStringLiteral("   כמות תמונות בהזמנה  ")},
    {QStringLiteral("MachpeelLeHiyoov"), QString()},
    {QStringLiteral("Mor"), QString()},
    {QStringLiteral("Prise4Daf"), QString()},
    {QStringLiteral("QamootTmoonotLeHiyoov"), QString()},
    {QStringLiteral("ShemBaalHacrtis"), QString()},
    {QStringLiteral("YetraKodemet"), QString()},
};

} // namespace

QString SettingsText(const ClientProfile& profile) {
    // The first piece is written twice: a reader drops it from its list.
    QString text =
        piece(QStringLiteral("TK1="), profile.FtpFolder1) + piece(QStringLiteral("TK1="), profile.FtpFolder1) +
        piece(QStringLiteral("TK2="), profile.FtpFolder2) + piece(QStringLiteral("ASP="), profile.ClientCode) +
        piece(QStringLiteral("SRT="), profile.FtpServer) + piece(QStringLiteral("PAS="), profile.FtpPassword) +
        piece(QStringLiteral("USR="), profile.FtpUser) + piece(QStringLiteral("SRK="), profile.ServerKey) +
        piece(QStringLiteral("STY="), QString::number(profile.JppBase)) +
        piece(QStringLiteral("MNA="), QString::number(profile.JppChunks)) +
        piece(QStringLiteral("ZPN="), QString::number(profile.ProfileNumber));
    for (std::size_t i = 0; i < 11; ++i) {
        if (const QString code = SizeCode(profile.SizeList[i]); !code.isEmpty())
            text += piece(QStringLiteral("D1="), code);
    }
    for (const QString& size : profile.QuickSizes) {
        if (const QString code = SizeCode(size); !code.isEmpty())
            text += piece(QStringLiteral("D2="), code);
    }
    return text;
}

SettingsPieces SplitSettings(const QString& text) {
    SettingsPieces result;
    qsizetype from = 0;
    for (std::size_t index = 1; index < result.table.size() && from < text.size(); ++index) {
        qsizetype end = text.indexOf(u'^', from + (index > 1 ? 1 : 0));
        if (end < 0)
            end = text.size();
        result.table[index] = text.mid(from, end - from);
        from = end;
        // The "^" that closes the text opens no further piece.
        if (from == text.size() - 1)
            break;
    }
    for (const QString& entry : result.table) {
        if (entry.startsWith(u'^'))
            result.pieces += entry.mid(1);
    }
    return result;
}

std::optional<OrderCardEntry> orderCardEntry(const SettingsPieces& settings) {
    for (const CardField& field : cardFields) {
        if (settings.table[1] != field.name)
            continue;
        OrderCardEntry entry;
        entry.field = field.name;
        entry.value = settings.table[2].mid(1);
        if (!field.caption.isEmpty())
            entry.line = field.caption + entry.value;
        if (field.name == u"GodeDaf")
            entry.number = Val(entry.value.left(10));
        return entry;
    }
    return std::nullopt;
}

QString Scramble(const QString& text) {
    return exchanged(text, plainAlphabet, permutation);
}

QString Unscramble(const QString& text) {
    return exchanged(text, permutation, plainAlphabet);
}

} // namespace lumora
