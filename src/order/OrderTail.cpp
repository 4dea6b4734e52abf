#include "order/OrderTail.h"

#include "common/AnsiCodePage.h"
#include "common/FixedText.h"
#include "order/TailTelephone.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The text is converted to the code page before it is cut, so that width counts bytes.
QByteArray field(const QString& text, int width) {
    return AnsiCodePage::encode(LeftField(AnsiCodePage::squeeze(text), width));
}

} // namespace

OrderTail OrderTail::of(const SessionState& state) {
    const bool photographer = state.Optint == OrderKind::Album && state.albumTail == AlbumTail::Photographer;
    const QString& telephone = photographer ? state.album.TelZalam : state.shemot.n2;
    return {TailTelephone(state).of(telephone),
            photographer ? state.album.ShemZalam : state.shemot.n1,
            QString::number(state.shemot.TotalPics),
            state.MisparHazmana,
            state.shemot.ser,
            {}};
}

QByteArray OrderTail::shortForm() const {
    // The first two fields once held the number of a split print's piece and the count of pieces; both are always 1.
    return field(u"1"_s, 2) + field(u"1"_s, 2) + field(telephone, TailTelephone::width) + field(name, 10) +
           field(totalPics, 3) + field(orderNumber, 3) + field(serial, 4) + field({}, 6);
}

QByteArray OrderTail::longForm(const QString& base) const {
    return shortForm() + field(u'^' + RightPart(AnsiCodePage::squeeze(base), 19), 20);
}

QByteArray OrderTail::form(int SugTzad, const QString& base) const {
    return SugTzad == longWidth ? longForm(base) : SugTzad == shortWidth ? shortForm() : QByteArray();
}

std::optional<OrderTail> OrderTail::parse(const QByteArray& bytes) {
    if (bytes.size() != shortWidth && bytes.size() != longWidth)
        return std::nullopt;
    const auto read = [&](int at, int width) {
        QString text = AnsiCodePage::decode(bytes.mid(at, width));
        while (text.endsWith(u' '))
            text.chop(1);
        return text;
    };
    OrderTail tail{read(4, 10), read(14, 10), read(24, 3), read(27, 3), read(30, 4), {}};
    if (bytes.size() == longWidth)
        tail.baseName = read(shortWidth + 1, longWidth - shortWidth - 1);
    return tail;
}

} // namespace lumora
