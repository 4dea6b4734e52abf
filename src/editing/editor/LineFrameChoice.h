#pragma once

#include <QChar>
#include <QString>
#include <QStringList>

namespace lumora {

// The line frame in hand: a colour letter of the palette and one of the styles on offer. The record carries it as
// "W05".
class LineFrameChoice {
public:
    static QStringList styles();

    // Goes so many styles further, at most to either end. Returns false and changes nothing for a step back before
    // the first choice.
    bool step(int places);
    void takeColour(QChar letter) { m_letter = letter; }

    int style() const { return m_style; } // its place in styles(), -1 before the first choice
    QString code() const;
    QString removedCode() const { return m_letter + QStringLiteral("00"); }

private:
    QChar m_letter = u'W';
    int m_style = -1;
};

} // namespace lumora
