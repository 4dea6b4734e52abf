#include "order/PieceName.h"

#include <algorithm>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int tailLength = 12;
constexpr int endingLength = 4; // as in "a.jpp"; in a stem "_" stands for the "."

QString without(const QString& text, int last) {
    return text.left(std::max<qsizetype>(text.size() - last, 0));
}

} // namespace

bool IsPiece(const QString& name) {
    return name.endsWith(u"prk"_s);
}

QString PieceStem(const QString& leaf) {
    return without(leaf, endingLength) + u'_' + leaf.right(3);
}

QString PieceTail(int sequence, const QString& total) {
    return u'_' + PieceNumber(sequence) + u'_' + total + u".prk"_s;
}

QString PieceNumber(int number) {
    return QString::number(number).rightJustified(3, u'0');
}

QString FamilyKey(const QString& path) {
    return without(path, tailLength);
}

QString PieceBeside(const QString& path, int sequence) {
    return FamilyKey(path) + u'_' + PieceNumber(sequence) + u'_' + path.right(7);
}

QString PieceSequence(const QString& name) {
    return name.right(11).left(3);
}

QString PieceTotal(const QString& name) {
    return name.right(11).mid(4, 3);
}

std::optional<QString> JoinedName(const QString& leaf) {
    const QString stem = FamilyKey(leaf);
    if (stem.isEmpty())
        return std::nullopt;
    return without(stem, endingLength) + u'.' + stem.right(3);
}

} // namespace lumora
