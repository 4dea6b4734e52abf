#include "editing/caption/mikledet.h"

#include "editing/editor/tFrmNew.h"
#include "order/EditRecord.h"
#include "platform/Dialogs.h"
#include "platform/Platform.h"
#include "session/PageChain.h"
#include "session/SessionState.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr int moveMilliseconds = 20;
constexpr int sizeMilliseconds = 4;
constexpr int paletteField = 46; // pixels a side: a fingertip

// A new caption has the second.
constexpr std::array<QRgb, 9> colours = {0xFFFFFFFF, 0xFFFFFF1E, 0xFFFF8C00, 0xFFDC1414, 0xFFFF4FA3,
                                         0xFF7B2CBF, 0xFF1450D2, 0xFF148C28, 0xFF000000};

Bitmap palette() {
    QImage image(paletteField * static_cast<int>(colours.size()), paletteField, QImage::Format_RGB32);
    for (int x = 0; x < image.width(); ++x) {
        for (int y = 0; y < image.height(); ++y)
            image.setPixel(x, y, colours[static_cast<std::size_t>(x / paletteField)]);
    }
    return Bitmap(image);
}

} // namespace

mikledet::mikledet(SessionState& state, const Platform& platform, PageChain& chain)
    : Page(pageId)
    , m_state(state)
    , m_edit(state.edit)
    , m_platform(platform)
    , m_chain(chain)
    , m_timer1(moveMilliseconds, [this] { moveOnce(); })
    , m_timer2(sizeMilliseconds, [this] { resizeOnce(); })
    , m_guard(state) {
    connect(&chain, &PageChain::shown, this, [this] {
        stopHolds();
        refresh(); // another picture may have been opened since
    });
}

void mikledet::load() {
    EditFields& edit = m_edit;
    Picture18Image = palette();
    letters = m_state.english() ? KeyLayout::Letters::Small : KeyLayout::Letters::Hebrew;
    if (edit.TextOn == 0) {
        edit.TextFont = u"David"_s;
        edit.TextFontSize = 14;
    }
    open(edit.TextOn == 0 ? QString() : edit.TextBody, edit.TextOn != 0);
}

void mikledet::open(const QString& text, bool onPicture) {
    Text1.text = text;
    Check4.checked = onPicture;
    Q_EMIT changed();
}

void mikledet::relabel(KeyLayout::Letters to) {
    letters = to;
    for (int key = 0; key < KeyLayout::keys; ++key)
        leter[static_cast<std::size_t>(key)].text = KeyLayout::caption(key, letters);
    refresh();
}

void mikledet::refresh() {
    Command4.checked = letters == KeyLayout::Letters::Hebrew;
    Command9.checked = letters == KeyLayout::Letters::Small;
    Command2.checked = letters == KeyLayout::Letters::Capital;
    for (int alignment = 0; alignment < 3; ++alignment)
        Image5[static_cast<std::size_t>(alignment)].checked = m_edit.TextAlign == alignment;
    Q_EMIT changed();
}

void mikledet::turnSymbols() {
    Frame1.visible = !Frame1.visible;
    Q_EMIT changed();
}

void mikledet::press(int key) {
    if (key >= 0 && key < KeyLayout::keys)
        type(leter[static_cast<std::size_t>(key)].text);
}

void mikledet::takeKey(QChar character) {
    if (character == u' ') {
        typeBlank();
    } else if (character == u'\r' || character == u'\n') {
        breakLine();
    } else if (character == u'\b') {
        takeBack();
    } else if (const auto text = KeyLayout::typed(character)) {
        type(*text);
    } else if (character.isPrint() || character.isHighSurrogate()) {
        m_platform.dialogs.message(
            m_state.wording(u"אי אפשר להדפיס את הסימן הזה"_s, u"This character can't be printed"_s));
    }
}

void mikledet::type(const QString& text) {
    if (Text1.text.size() >= mostLetters) {
        m_platform.dialogs.message(m_state.wording(u"עד  60  אותיות"_s, u"Up to 60 letters"_s));
        return;
    }
    Text1.text += text;
    textChanged();
    Frame1.visible = false;
    Q_EMIT changed();
}

void mikledet::typeBlank() {
    Text1.text += u' ';
    Q_EMIT changed();
}

void mikledet::takeBack() {
    if (Text1.text.isEmpty())
        return;
    Text1.text.chop(m_guard.lastSign(Text1.text));
    textChanged();
}

void mikledet::breakLine() {
    Text1.text += u"\r\n"_s;
    textChanged();
}

void mikledet::clear() {
    Text1.text.clear();
    textChanged();
    Frame1.visible = false;
    Q_EMIT changed();
}

void mikledet::putOnPicture(bool on) {
    Check4.checked = on;
    m_edit.TextOn = on ? 1 : 0;
    commitText();
}

void mikledet::chooseFont(int index) {
    if (index < 0 || index >= Combo1List.count())
        return;
    Combo1List.setCurrentIndex(index);
    Combo1.text = Combo1List.currentItem();
    m_edit.TextFont = Combo1.text;
    commitText();
}

void mikledet::backToEditor() {
    stopHolds();
    Frame1.visible = false;
    m_chain.follow(pageId, Outcome::EditingDone);
}

void mikledet::holdArrow(int direction) {
    constexpr std::int16_t step = CaptionStep::step;
    switch (direction) {
    case 0:
        return holdMove(-step, 0);
    case 1:
        return holdMove(step, 0);
    case 2:
        return holdMove(0, -step);
    case 3:
        return holdMove(0, step);
    default:
        return;
    }
}

void mikledet::holdSize(std::int16_t by) {
    SizeStep = by;
    m_held.press(m_timer2);
}

void mikledet::holdMove(std::int16_t x, std::int16_t y) {
    MoveStepX = x;
    MoveStepY = y;
    m_held.press(m_timer1);
}

void mikledet::moveOnce() {
    if (!m_held.ticks(m_timer1))
        return;
    CaptionStep::move(m_edit, MoveStepX, MoveStepY);
    commitStep();
}

void mikledet::resizeOnce() {
    if (!m_held.ticks(m_timer2))
        return;
    CaptionStep::resize(m_edit, SizeStep);
    commitStep();
}

void mikledet::endHold(HeldButton::End how) {
    if (!m_held.end(how))
        return;
    if (auto* editor = m_chain.find<tFrmNew>())
        editor->keepRecord();
}

void mikledet::change(void (*step)(EditFields& edit)) {
    step(m_edit);
    commitText();
}

void mikledet::align(int alignment) {
    if (alignment < 0 || alignment > EditRecord::alignFar)
        return;
    m_edit.TextAlign = static_cast<std::int16_t>(alignment);
    commitText();
}

void mikledet::takeColour(QPoint at) {
    if (!Picture18Image.image().rect().contains(at))
        return;
    CaptionStep::colour(m_edit, Picture18Image.image().pixel(at));
    commitText();
}

int mikledet::style() const {
    return m_edit.TextStyle & 3;
}

bool mikledet::runsDown() const {
    return m_edit.TextVertical == EditRecord::runsDown;
}

QRgb mikledet::colour() const {
    return qRgb(m_edit.TextRed, m_edit.TextGreen, m_edit.TextBlue);
}

void mikledet::textChanged() {
    m_edit.TextBody = Text1.text;
    commitText();
}

void mikledet::commitText() {
    m_chain.load<tFrmNew>().takeCaption();
    refresh();
}

void mikledet::commitStep() {
    m_chain.load<tFrmNew>().takeCaptionStep();
    refresh();
}

} // namespace lumora
