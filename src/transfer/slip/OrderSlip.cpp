#include "transfer/slip/OrderSlip.h"

#include "imaging/drawing/QrCode.h"
#include "order/OrderFolder.h"
#include "session/SessionState.h"
#include "transfer/delivery/OrderFacts.h"
#include "transfer/delivery/SendingTexts.h"

#include <QBuffer>
#include <QFontMetrics>
#include <QPageSize>
#include <QPainter>
#include <QPdfWriter>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// In tenths of a millimetre. A roll is printed on 72 of its 80 mm.
constexpr int slipWidth = 800;
constexpr int slipSide = 50;
constexpr int slipTop = 40;
constexpr int codeSide = 340;
constexpr int endHeight = 110;

QFont slipFont(int size, bool strong) {
    QFont font(u"Noto Sans Hebrew"_s);
    font.setPixelSize(size);
    font.setBold(strong);
    return font;
}

// As large as it fits.
QFont fittingFont(const QString& text, int size, bool strong, int room) {
    while (size > 12 && QFontMetrics(slipFont(size, strong)).horizontalAdvance(text) > room)
        size -= 2;
    return slipFont(size, strong);
}

// Numbers run from left to right on a Hebrew slip too.
QString inLeftToRight(const QString& text) {
    return u"\u2066%1\u2069"_s.arg(text);
}

} // namespace

QString OrderSlip::codeOf(const SessionState& state) {
    return QStringList(
               {OrderFolder::chosen(state).name(), QString::number(state.shemot.TotalPics), GivenTelephone(state)})
        .join(u'\n');
}

OrderSlip::OrderSlip(const SessionState& state)
    : m_english(state.english())
    , m_code(codeOf(state)) {
    const auto words = [this](const SendingWords& both) {
        return QString::fromUtf16(m_english ? both.english : both.hebrew);
    };
    const QString order = OrderFolder::chosen(state).name();
    if (const QString lab = state.profile.LabName1.trimmed(); !lab.isEmpty())
        m_rows += {{}, lab, 60, 36, true};
    m_rows += {{}, words(slipNumberWords), 60, 34};
    m_rows += {{}, inLeftToRight(ShortNumber(order)), 160, 150, true};
    m_rows += {{}, inLeftToRight(order), 60, 26};
    m_rows += {words(slipPrintsWords), inLeftToRight(QString::number(state.shemot.TotalPics)), 60, 40, true};
    if (const QString telephone = GivenTelephone(state); !telephone.isEmpty())
        m_rows += {words(slipTelephoneWords), inLeftToRight(telephone), 60, 40, true};
    if (const QString lab = state.profile.LabPhone.trimmed(); !lab.isEmpty())
        m_end = words(forQuestionsWords).trimmed().arg(inLeftToRight(lab));
}

int OrderSlip::rowsHeight() const {
    int height = 0;
    for (const Row& row : m_rows)
        height += row.height;
    return height;
}

QSize OrderSlip::size() const {
    return {slipWidth, slipTop + rowsHeight() + codeSide + (m_end.isEmpty() ? 0 : endHeight) + slipTop};
}

void OrderSlip::paint(QPainter& painter) const {
    painter.setPen(Qt::black);
    painter.setLayoutDirection(m_english ? Qt::LeftToRight : Qt::RightToLeft);
    const int room = slipWidth - 2 * slipSide;
    int y = slipTop;
    for (const Row& row : m_rows) {
        const QRect place(slipSide, y, room, row.height);
        const bool inMiddle = row.name.isEmpty();
        painter.setFont(fittingFont(row.text, row.letters, row.strong, inMiddle ? room : room * 2 / 3));
        painter.drawText(place, Qt::AlignVCenter | Qt::TextSingleLine | (inMiddle ? Qt::AlignHCenter : Qt::AlignRight),
                         row.text);
        if (!inMiddle) {
            painter.setFont(slipFont(row.letters, false));
            painter.drawText(place, Qt::AlignVCenter | Qt::TextSingleLine | Qt::AlignLeft, row.name);
        }
        y += row.height;
    }
    if (const Bitmap code = qrCode(m_code, 8); !code.isNull())
        painter.drawImage(QRect((slipWidth - codeSide) / 2, y, codeSide, codeSide), code.image());
    y += codeSide;
    painter.setFont(slipFont(30, false));
    painter.drawText(QRect(slipSide, y, room, endHeight), Qt::AlignHCenter | Qt::AlignVCenter | Qt::TextWordWrap,
                     m_end);
}

QByteArray OrderSlip::pdf() const {
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QPdfWriter writer(&buffer);
    writer.setResolution(254);
    writer.setPageSize(QPageSize(QSizeF(size()) / 10, QPageSize::Millimeter, {}, QPageSize::ExactMatch));
    writer.setPageMargins({});
    QPainter painter;
    if (!painter.begin(&writer))
        return {};
    paint(painter);
    painter.end();
    return bytes;
}

} // namespace lumora
