#pragma once

#include "platform/Dialogs.h"

#include <QObject>
#include <QPointer>
#include <QStringList>

#include <functional>
#include <optional>

class QEventLoop;

namespace lumora {

class MainWindow;
class MessagePanel;
class TextPanel;
struct Platform;
struct SessionState;

// The boxes of the program as panels over the page. Messages queue up and the page goes on below them; a question and
// the picture picker wait for the answer in an event loop of their own, which stands here and nowhere else.
class ScreenDialogs : public QObject, public Dialogs {
    Q_OBJECT
public:
    // The platform may name these boxes as its own; nothing of it is used before the picker opens.
    ScreenDialogs(MainWindow& window, const SessionState& state, const Platform& platform);
    ~ScreenDialogs() override;

    void message(const QString& text, const QString& title = {}) override;
    bool ask(const QString& question, const QString& title = {}) override;
    DrivePath pickFile(const QString& prompt, const DrivePath& initialFolder, const QString& title,
                       Offer offer) override;

    Result<void> showText(const HostPath& file, const QString& title) override;

    bool isWaiting() const override { return !m_answers.isEmpty(); }
    void closeAll() override;

    // Runs before a picture is picked, so that cards put in meanwhile are found.
    std::function<void()> beforePick;

    // Answers given in place of a person's; no value lets the panel come up. A pick is empty for a
    // cancel.
    std::function<std::optional<DrivePath>()> nextPick;
    std::function<std::optional<bool>()> nextAnswer;

    // Every box and question so far, oldest first.
    QStringList shownTexts;
    // The box in front, empty when there is none.
    QString frontText() const;
    // As if the person had closed every box that is open or waits.
    void closeMessages();

private:
    struct Box {
        QString text;
        QString title;
    };
    void showNext();
    void closeText();
    QString closingText() const;
    void waitIn(QEventLoop& loop);

    MainWindow& m_window;
    const SessionState& m_state;
    const Platform& m_platform;
    QList<Box> m_waiting;
    QPointer<MessagePanel> m_panel;
    QPointer<TextPanel> m_text;
    QList<QEventLoop*> m_answers; // loops that wait for one; a loop's box has said no as long as nobody has answered
};

} // namespace lumora
