// What the start page must have and no step of the program reaches: the service panel, the countdown, and the fetch of
// the advertising picture.
#include "common/AnsiCodePage.h"
#include "platform/Dialogs.h"
#include "platform/files/Files.h"
#include "platform/line/Internet.h"
#include "session/PageChain.h"
#include "session/Workspace.h"
#include "session/lab/SettingsText.h"
#include "start/hatchala.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// In bytes. A settings text is one line, but a foreign server may send anything in its place.
constexpr qint64 largestSettingsFile = 1 << 16;

} // namespace

void hatchala::showSender() {
    m_chain.follow(PageId::hatchala, Outcome::SendingWanted);
}

void hatchala::StartAutomatically() {
    startWith(u"PIC"_s);
}

void hatchala::countDown() {
    if (Pic4Hemshech.visible)
        return;
    if (m_secondsLeft >= 1) {
        Label6.text = QString::number(--m_secondsLeft);
        Label6.visible = Label7.visible = true;
        Q_EMIT changed();
        return;
    }
    m_timers.Timer4.stop();
    m_timers.Timer4.setInterval(0);
    StartAutomatically();
}

void hatchala::fetchPicture() {
    m_timers.Timer1.stop();
    // A failed fetch is ignored: a picture that is there already is shown.
    const auto target = m_platform.files.drives().toHost(m_state.profile.AdFile1);
    if (target && Workspace(m_state, m_platform.files).MakeRootFolders())
        (void)m_platform.internet.download(m_state.profile.AdUrl1, *target);
    if (m_platform.files.fileExists(m_state.profile.AdFile1)) {
        Picture4 = m_state.profile.AdFile1;
        m_timers.Timer2.start();
    }
    Q_EMIT changed();
}

DrivePath hatchala::settingsFile() const {
    return WorkspacePaths::root(m_state) / (m_state.profile.ClientCode + u".txt"_s);
}

void hatchala::BuildSettingsText() {
    const QString text = SettingsText(m_state.profile);
    const DrivePath path = settingsFile();
    if (const Result<void> written = m_platform.files.writeWhole(path, AnsiCodePage::encode(text) + "\r\n"); !written)
        m_platform.dialogs.message(written.failure().message);
    Label5.text = text;
    SplitSettingsText(text);
}

void hatchala::SplitSettingsText(const QString& text) {
    List4pices.clear();
    List4pices.append(SplitSettings(text).pieces);
    Q_EMIT changed();
}

void hatchala::DownloadSettings() {
    const Workspace workspace(m_state, m_platform.files);
    if (!workspace.MakeRootFolders())
        return;
    const DrivePath path = settingsFile();
    (void)m_platform.files.removeFile(path);
    // After a failure the file is missing, which tells the caller.
    if (const auto target = m_platform.files.drives().toHost(path))
        (void)m_platform.internet.download(
            u"http://%1/00natoonim/%2.txt"_s.arg(m_state.profile.SettingsHost, m_state.profile.ClientCode), *target);
}

void hatchala::ReadSettingsFile(const DrivePath& path) {
    List2.clear();
    const bool named = path.leaf() == m_state.profile.ClientCode + u".txt"_s;
    const Result<qint64> size = m_platform.files.size(path);
    const Result<QByteArray> bytes = named && size && *size <= largestSettingsFile
                                         ? m_platform.files.read(path)
                                         : Result<QByteArray>(Failure{Failure::Kind::NotFound, {}});
    if (!bytes) {
        m_platform.dialogs.message(u"No Server"_s);
        return;
    }
    QString text = AnsiCodePage::decode(*bytes);
    text.replace(u"\r\n"_s, u"\n"_s);
    if (text.endsWith(u'\n'))
        text.chop(1);
    if (!bytes->isEmpty())
        List2.append(text.split(u'\n'));
}

void hatchala::fetchSettings() {
    DownloadSettings();
    ReadSettingsFile(settingsFile());
    if (List2.isEmpty())
        m_platform.dialogs.message(u"No Server 2"_s);
    else
        SplitSettingsText(List2.item(0));
    Q_EMIT changed();
}

// The scrambled form applies the substitution twice (docs/formats.md, Settings text).
void hatchala::scramble() {
    Label5.text = Scramble(Scramble(Label5.text));
    Q_EMIT changed();
}

void hatchala::unscramble() {
    Label5.text = Unscramble(Unscramble(Label5.text));
    Q_EMIT changed();
}

} // namespace lumora
