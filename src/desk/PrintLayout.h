#pragma once

#include "common/Result.h"

#include <QString>

namespace lumora {

struct PrintFileName;

// What a print file's code says, in words that folders and lists are named by.
struct PrintWords {
    QString size;   // "10x15"; "nosize" for a code without one
    QString paper;  // "matte", "glossy", "nopaper"
    QString border; // "noborder", "white", "black", "unasked"; else the code's own two characters
    int copies = 0;

    static PrintWords of(const PrintFileName& name);
};

// Letters, digits, dots, "_" and "-"; each other character is a "-". For names that minilabs take.
QString plainName(const QString& text);

// Into which folder a print goes, as "size-paper-border/copies": the words size, paper, border, copies and order, "-"
// or
// "_" between them, "/" between folders.
class PrintLayout {
public:
    static inline const QString usual = QStringLiteral("size-paper-border/copies");

    static Result<PrintLayout> parse(const QString& text);

    // Relative, without a "/" at the end.
    QString folderOf(const PrintWords& words, const QString& order) const;

private:
    explicit PrintLayout(QString text)
        : m_text(std::move(text)) {}

    QString m_text;
};

} // namespace lumora
