#include "views/window/ScreenDialogs.h"

#include "session/SessionState.h"
#include "views/window/MainWindow.h"
#include "views/window/MessagePanel.h"
#include "views/window/PicturePicker.h"
#include "views/window/TextPanel.h"

#include <QEventLoop>
#include <QFile>
#include <QStringDecoder>

#include <utility>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

constexpr qint64 largestText = 4 << 20; // bytes

} // namespace

ScreenDialogs::ScreenDialogs(MainWindow& window, const SessionState& state, const Platform& platform)
    : m_window(window)
    , m_state(state)
    , m_platform(platform) {}

ScreenDialogs::~ScreenDialogs() = default;

void ScreenDialogs::message(const QString& text, const QString& title) {
    shownTexts += text;
    m_waiting.append({text, title});
    if (!m_panel)
        showNext();
}

void ScreenDialogs::showNext() {
    if (m_waiting.isEmpty())
        return;
    const Box& box = m_waiting.first();
    m_panel = new MessagePanel(m_window.theme(), &m_window, MessagePanel::Kind::Message, box.title, box.text,
                               {closingText()});
    m_panel->setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    connect(m_panel, &MessagePanel::answered, this, [this, panel = m_panel] {
        if (m_panel != panel)
            return;
        panel->dismiss();
        m_panel = nullptr;
        m_waiting.removeFirst();
        showNext();
    });
    m_panel->setOpen(true);
}

QString ScreenDialogs::closingText() const {
    return m_state.wording(u"הבנתי"_s, u"OK"_s);
}

QString ScreenDialogs::frontText() const {
    return m_waiting.isEmpty() ? QString() : m_waiting.first().text;
}

void ScreenDialogs::closeMessages() {
    m_waiting.clear();
    if (m_panel)
        std::exchange(m_panel, nullptr)->dismiss();
}

Result<void> ScreenDialogs::showText(const HostPath& file, const QString& title) {
    QFile text(toText(file));
    if (!text.open(QIODevice::ReadOnly))
        return Failure{Failure::Kind::NotFound, u"%1: %2"_s.arg(text.fileName(), text.errorString())};
    const QByteArray bytes = text.read(largestText + 1);
    if (text.error() != QFileDevice::NoError || bytes.size() > largestText)
        return Failure{Failure::Kind::TooLarge, u"%1 can't be read, or is larger than 4 MB"_s.arg(text.fileName())};
    QStringDecoder decoder = QStringDecoder::decoderForHtml(bytes);
    closeText();
    m_text = new TextPanel(m_window.theme(), &m_window, title, decoder(bytes), file.parent_path(),
                           m_state.wording(u"חזרה"_s, u"Back"_s));
    m_text->setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    connect(m_text, &TextPanel::closed, this, &ScreenDialogs::closeText);
    m_text->setOpen(true);
    return {};
}

void ScreenDialogs::closeText() {
    if (m_text)
        std::exchange(m_text, nullptr)->dismiss();
}

void ScreenDialogs::closeAll() {
    closeMessages();
    closeText();
    for (QEventLoop* loop : m_answers)
        loop->quit();
}

void ScreenDialogs::waitIn(QEventLoop& loop) {
    m_answers += &loop;
    loop.exec();
    m_answers.removeAll(&loop);
}

bool ScreenDialogs::ask(const QString& question, const QString& title) {
    shownTexts += question;
    if (nextAnswer) {
        if (const std::optional<bool> answer = nextAnswer())
            return *answer;
    }
    MessagePanel panel(m_window.theme(), &m_window, MessagePanel::Kind::Question, title, question,
                       {m_state.wording(u"כן"_s, u"Yes"_s), m_state.wording(u"לא"_s, u"No"_s)});
    panel.setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    QEventLoop loop;
    bool yes = false;
    connect(&panel, &MessagePanel::answered, &loop, [&](bool answer) {
        yes = answer;
        loop.quit();
    });
    panel.setOpen(true);
    waitIn(loop);
    panel.setOpen(false);
    return yes;
}

DrivePath ScreenDialogs::pickFile(const QString& prompt, const DrivePath& initialFolder, const QString& title,
                                  Offer offer) {
    if (beforePick)
        beforePick();
    if (nextPick) {
        if (const std::optional<DrivePath> pick = nextPick())
            return *pick;
    }
    PicturePicker picker(m_window.theme(), &m_window, m_state, m_platform, prompt, initialFolder, title, offer);
    picker.setLayoutDirection(m_state.english() ? Qt::LeftToRight : Qt::RightToLeft);
    QEventLoop loop;
    QString chosen;
    connect(&picker, &PicturePicker::finished, &loop, [&](const QString& path) {
        chosen = path;
        loop.quit();
    });
    picker.setOpen(true);
    waitIn(loop);
    picker.setOpen(false);
    return DrivePath(chosen);
}

} // namespace lumora
