#include "session/lab/SettingsText.h"

#include "common/FixedText.h"
#include "common/PaperSize.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The lab's site and all copies of the program agree on these two tables.
const QString plainAlphabet = u"abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ1234567890@*-_\\/+!. ^="_s;
const QString permutation = u"oC+U_Pqxd0ve67 I2DFg3A91VNlHp4ZzK5uOJmhk@nByiXrGL^EYfbR*c-Sa.\\Q!Ts/Mj=8wtW"_s;

QString exchanged(const QString& text, const QString& from, const QString& to) {
    QString result;
    for (const QChar letter : text) {
        if (const qsizetype at = from.indexOf(letter); at >= 0)
            result += to[at];
    }
    return result;
}

QString piece(const QString& key, const QString& value) {
    return key + (value.isEmpty() ? u"0"_s : value) + u'^';
}

struct CardField {
    QString name;
    QString caption; // empty: no line in the list
};

const std::vector<CardField> cardFields = {
    {u"FileDtt"_s, QString()},
    {u"HaeemHaytaSisma"_s, QString()},
    {u"DayOfOrder"_s, u"  תאריך הזמנה  "_s},
    {u"MisparHazmanaZo"_s, u" מספר הזמנה "_s},
    {u"ShemHamazmin"_s, u"  שם המזמין  "_s},
    {u"MisparHakartis"_s, u"   מספר כרטיס   "_s},
    {u"GodeDaf"_s, u"   גודל דף   "_s},
    {u"TotalPicsBeHazmanaZo"_s, u"   כמות תמונות בהזמנה  "_s},
    {u"MachpeelLeHiyoov"_s, QString()},
    {u"Mor"_s, QString()},
    {u"Prise4Daf"_s, QString()},
    {u"QamootTmoonotLeHiyoov"_s, QString()},
    {u"ShemBaalHacrtis"_s, QString()},
    {u"YetraKodemet"_s, QString()},
};

} // namespace

QString SettingsText(const ClientProfile& profile) {
    // The first piece is written twice, since a reader drops it from its list.
    QString text = piece(u"TK1="_s, profile.FtpFolder1) + piece(u"TK1="_s, profile.FtpFolder1) +
                   piece(u"TK2="_s, profile.FtpFolder2) + piece(u"ASP="_s, profile.ClientCode) +
                   piece(u"SRT="_s, profile.FtpServer) + piece(u"PAS="_s, profile.FtpPassword) +
                   piece(u"USR="_s, profile.FtpUser) + piece(u"SRK="_s, profile.ServerKey) +
                   piece(u"STY="_s, QString::number(profile.JppBase)) +
                   piece(u"MNA="_s, QString::number(profile.JppChunks)) +
                   piece(u"ZPN="_s, QString::number(profile.ProfileNumber));
    for (std::size_t i = 0; i < 11; ++i) {
        if (const QString code = SizeCode(profile.SizeList[i]); !code.isEmpty())
            text += piece(u"D1="_s, code);
    }
    for (const QString& size : profile.QuickSizes) {
        if (const QString code = SizeCode(size); !code.isEmpty())
            text += piece(u"D2="_s, code);
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
