#pragma once

#include "platform/Dialogs.h"
#include "platform/Instances.h"
#include "platform/Machine.h"
#include "platform/Platform.h"
#include "platform/files/Drives.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "platform/line/Mail.h"
#include "platform/media/Cards.h"
#include "support/DrivePathLiteral.h"

#include <QStringList>
#include <QTemporaryDir>

#include <functional>

// A platform for tests: real files in a temporary folder, hand-written fakes for what a person, a clock or a line would
// answer.
namespace lumora {

using namespace Qt::StringLiterals; // tests write their texts in the short form

class RecordedDialogs : public Dialogs {
public:
    void message(const QString& text, const QString& = {}) override { messages += text; }
    bool ask(const QString& question, const QString& title = {}) override {
        questions += question;
        questionTitles += title;
        return !answers.isEmpty() && answers.takeFirst();
    }
    DrivePath pickFile(const QString& prompt, const DrivePath& initialFolder, const QString& title, Offer) override {
        pickRequests += prompt + u'|' + initialFolder.text() + u'|' + title;
        return picks.isEmpty() ? DrivePath() : picks.takeFirst();
    }

    Result<void> showText(const HostPath& file, const QString& title) override {
        texts += toText(file) + u'|' + title;
        return {};
    }

    QStringList messages;
    QStringList texts;
    QStringList questions;
    QStringList questionTitles;
    QStringList pickRequests;
    QList<DrivePath> picks; // answers of the next file dialogs, in order
    QList<bool> answers;    // answers of the next questions, in order
};

class FixedClock : public Clock {
public:
    QDateTime now() const override { return time; }
    std::chrono::milliseconds running() const override { return ran; }
    QDateTime time = QDateTime(QDate(2026, 11, 21), QTime(14, 5, 9));
    std::chrono::milliseconds ran{0};
};

// Counts the pumps; a test may let something happen at one, as a click that arrives meanwhile.
class ScriptedPump : public EventPump {
public:
    void pump() override {
        ++count;
        if (onPump && !m_pumping) {
            m_pumping = true;
            onPump();
            m_pumping = false;
        }
    }
    bool pumping() const override { return m_pumping; }

    int count = 0;
    std::function<void()> onPump;

private:
    bool m_pumping = false;
};

class RecordedShell : public Shell {
public:
    void openWebPage(const QString& url, NotOpened notOpened) override {
        webPages += url;
        if (!opens)
            notOpened();
    }
    void openFolder(const DrivePath& folder, NotOpened) override { folders += folder.text(); }
    void copyToClipboard(const QString& text) override { clipboard = text; }
    void clearClipboard() override { clipboard.clear(); }

    bool opens = true;
    QStringList webPages;
    QStringList folders;
    QString clipboard;
};

class FixedVolume : public Volume {
public:
    Result<std::int32_t> serial(const DrivePath&) const override {
        if (fails)
            return Failure{Failure::Kind::Other, u"no serial"_s};
        return number;
    }
    std::int32_t number = -987651234;
    bool fails = false;
};

// A machine without a line.
class NoInternet : public Internet {
public:
    bool open() override { return false; }
    bool connectedState() const override { return false; }
    Result<std::unique_ptr<FtpConnection>> connectFtp(const QString&, const QString&, const QString&,
                                                      DataChannel) override {
        return noLine();
    }
    Result<WebAnswer> fetch(const QString&) override { return noLine(); }
    Result<WebAnswer> post(const QString&, const PostRequest&) override { return noLine(); }
    Result<std::optional<qint64>> contentLength(const QString&) override { return noLine(); }
    Result<void> download(const QString&, const HostPath&) override { return noLine(); }

private:
    static Failure noLine() { return {Failure::Kind::Disconnected, u"no line"_s}; }
};

class RecordedMail : public Mail {
public:
    MailOutcome send(const MailAccount&, const MailMessage& message) override {
        messages += message;
        if (onSend)
            onSend();
        return outcomes.isEmpty() ? MailOutcome() : outcomes.takeFirst();
    }

    QList<MailMessage> messages;
    std::function<void()> onSend; // what happens while a message is under way
    QList<MailOutcome> outcomes;  // of the next messages, in order; after them all succeed
};

class RecordedPrinter : public Printer {
public:
    void print(const QString& queue, const QByteArray& pdf, Done done) override {
        papers += {queue, pdf};
        whenDone = std::move(done);
    }
    QList<std::pair<QString, QByteArray>> papers;
    Done whenDone; // of the last one
};

// The drives C: (in a temporary folder) and Z: with everything that a page asks for.
class TestPlatform {
public:
    TestPlatform()
        : TestPlatform(noInternet) {}
    // The same with a line.
    explicit TestPlatform(Internet& internet)
        : drives(made("drive_c"), u'C', {made("media")})
        , files(drives)
        , instances(drives.dataFolder())
        , platform{files, dialogs, internet, mail, shell, clock, pump, volume, instances, cards, printer, {}} {}

    // The platform with another part in the place of its own.
    Platform with(Dialogs& other, Cards& media, Internet& line) {
        return {files, other, line, mail, shell, clock, pump, volume, instances, media, printer, {}};
    }
    Platform with(Dialogs& other) { return with(other, cards, noInternet); }
    Platform with(Cards& media) { return with(dialogs, media, noInternet); }

    QTemporaryDir folder;
    Drives drives;
    Files files;
    Instances instances;
    RecordedDialogs dialogs;
    RecordedShell shell;
    FixedClock clock;
    ScriptedPump pump;
    FixedVolume volume;
    NoInternet noInternet;
    RecordedMail mail;
    Cards cards;
    RecordedPrinter printer;
    Platform platform;

private:
    HostPath made(const char* name) const {
        const HostPath path = HostPath(folder.path().toStdString()) / name;
        std::filesystem::create_directories(path);
        return path;
    }
};

} // namespace lumora
