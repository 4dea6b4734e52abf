#include "desk/PrintLayout.h"

#include "order/PrintCode.h"
#include "order/PrintFileName.h"

#include <QRegularExpression>
#include <QStringList>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

const QStringList layoutWords{u"size"_s, u"paper"_s, u"border"_s, u"copies"_s, u"order"_s};

// "1015" and "10/15" give "10x15", "9/13" gives "9x13".
QString sizeWord(const QString& code) {
    const auto side = [](QString end) { return end.remove(QRegularExpression(u"[^A-Za-z0-9]"_s)); };
    const QString first = side(code.left(2));
    const QString last = side(code.right(2));
    return first.isEmpty() || last.isEmpty() ? u"nosize"_s : first + u'x' + last;
}

QString borderWord(const QString& code) {
    if (code == u"NB"_s)
        return u"noborder"_s;
    if (code == u"WB"_s)
        return u"white"_s;
    if (code == u"BK"_s)
        return u"black"_s;
    return code == u"NN"_s ? u"unasked"_s : plainName(code);
}

} // namespace

PrintWords PrintWords::of(const PrintFileName& name) {
    const QChar paper = PrintCode::paperOf(name.code);
    return {sizeWord(name.code.mid(PrintCode::copiesWidth, 4)),
            paper == u'M'   ? u"matte"_s
            : paper == u'G' ? u"glossy"_s
                            : u"nopaper"_s,
            borderWord(name.code.mid(PrintCode::paperAt + 1)), name.copies()};
}

QString plainName(const QString& text) {
    static const QRegularExpression others(u"[^A-Za-z0-9._-]"_s);
    return QString(text).replace(others, u"-"_s);
}

Result<PrintLayout> PrintLayout::parse(const QString& text) {
    static const QRegularExpression between(u"[-_/]"_s);
    for (const QString& word : text.split(between)) {
        if (!layoutWords.contains(word))
            return Failure{Failure::Kind::Unsupported,
                           u"The layout \"%1\" has \"%2\"; its words are %3, with -, _ or / between them."_s.arg(
                               text, word, layoutWords.join(u", "_s))};
    }
    return PrintLayout(text);
}

QString PrintLayout::folderOf(const PrintWords& words, const QString& order) const {
    static const QRegularExpression word(u"[a-z]+"_s);
    const QStringList values{words.size, words.paper, words.border, QString::number(words.copies), plainName(order)};
    QString folder;
    qsizetype done = 0;
    for (auto matches = word.globalMatch(m_text); matches.hasNext();) {
        const QRegularExpressionMatch match = matches.next();
        folder += m_text.mid(done, match.capturedStart() - done) + values[layoutWords.indexOf(match.captured())];
        done = match.capturedEnd();
    }
    return folder;
}

} // namespace lumora
