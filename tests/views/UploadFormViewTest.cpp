#include "PageLook.h"

#include "platform/Platform.h"
#include "platform/files/Files.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/LabServers.h"
#include "transfer/http/UploadForm.h"
#include "views/window/MainWindow.h"

#include <QTest>

#include <gtest/gtest.h>

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// The page that sends by HTTP, in each state that a customer meets, over a line that is dead at first.
class UploadFormLook : public PageLook {
protected:
    UploadFormLook()
        : walk(GetParam().size, u"[Addresses]\nHttpHost = http://127.0.0.1:9\nHttpTikiya = hazmanot\n"
                                "HttpScriptPath = /hazmanot/\n[Switches]\nSender = http\n"_s) {
        if (GetParam().english)
            walk.press(u"hatchala"_s, u"Check1"_s);
        const Files& files = walk.program().platform().files;
        QString folder = u"C:"_s;
        for (const char* part : {"\\2000lumora", "\\!!000", "\\2026_11_21_KUP_1234^105"}) {
            folder += QString::fromLatin1(part);
            EXPECT_TRUE(files.folderExists(folder) || files.makeFolder(folder).ok());
        }
        for (const char* name : {"\\!105_1234.jpg", "\\2026_11_21_KUP_1234^105.txt", "\\021015GNB0000_03AABB.jpp",
                                 "\\111015GNB0001_03AACC.jpp"})
            EXPECT_TRUE(files.writeWhole(folder + QString::fromLatin1(name), "bytes").ok());
        walk.program().state().transfer.OrderFolder = folder;
    }

    UploadForm& page() { return walk.page<UploadForm>(PageId::UploadForm); }
    // Looks at the page from within its own work, as soon as it is so far. One after the other.
    void lookWhen(const QString& name, std::function<bool()> soFar) { waits.emplace_back(name, std::move(soFar)); }
    void lookIfDue() {
        if (looking || waits.empty() || !waits.front().second())
            return;
        const QString name = waits.front().first;
        waits.erase(waits.begin());
        looking = true;
        look(walk, name);
        looking = false;
    }
    template <class Reached>
    void waitUntil(Reached reached) {
        ASSERT_TRUE(QTest::qWaitFor(reached, 20000)) << qPrintable(page().Label4Do.text);
    }

    Walk walk;
    std::vector<std::pair<QString, std::function<bool()>>> waits;
    bool looking = false;
};

} // namespace

TEST_P(UploadFormLook, FromTheCheckThroughAFailureToTheEndPanel) {
    lookWhen(u"60-http-checking"_s, [&] { return page().Pic4Hamten.visible; });
    walk.program().chain().show(PageId::UploadForm);
    QObject::connect(&page(), &Page::changed, &page(), [&] { lookIfDue(); });
    waitUntil([&] { return page().Timer1.running(); });
    page().Timer1.stop();
    look(walk, u"61-http-countdown"_s);
    walk.press(u"UploadForm"_s, u"Command3"_s);
    look(walk, u"62-http-stopped"_s);
    lookWhen(u"63-http-sending"_s, [&] { return page().percent >= 50; });
    lookWhen(u"64-http-sending-again"_s, [&] { return page().percent == 25 && !page().Label1.text.isEmpty(); });
    walk.press(u"UploadForm"_s, u"Command10"_s);
    page().Timer1.stop();
    page().Label8.text = u"0"_s;
    page().Timer2_Tick();
    ASSERT_TRUE(page().failed);
    look(walk, u"65-http-failed"_s);

    const LabServers lab;
    ASSERT_TRUE(lab.running()) << qPrintable(lab.failure());
    walk.program().state().profile.HttpHost = lab.site();
    lookWhen(u"66-http-verifying"_s,
             [&] { return page().sending && page().Label4File.text.isEmpty() && page().Label12.text == u"0"_s; });
    walk.press(u"UploadForm"_s, u"Image5"_s);
    waitUntil([&] { return page().done; });
    EXPECT_EQ(waits.size(), 0u) << qPrintable(waits.front().first);
    look(walk, u"67-http-sent"_s);
    PageChain& chain = walk.program().chain();
    chain.unload(PageId::UploadForm);
    chain.show(PageId::UploadForm);
    waitUntil([&] { return page().done; });
    EXPECT_TRUE(page().Label11.visible);
    look(walk, u"70-http-all-there"_s);
    walk.press(u"UploadForm"_s, u"Command28"_s);
    EXPECT_EQ(chain.front()->id(), PageId::hatchala);
}

TEST_P(UploadFormLook, WithoutAServerAndWithoutAnOrder) {
    walk.program().state().profile.HttpHost.clear();
    walk.program().chain().show(PageId::UploadForm);
    waitUntil([&] { return page().failed; });
    look(walk, u"68-http-no-server"_s);
    walk.program().state().transfer.OrderFolder.clear();
    walk.press(u"UploadForm"_s, u"Command2"_s);
    look(walk, u"69-http-no-order"_s);
}

INSTANTIATE_TEST_SUITE_P(Screens, UploadFormLook, PageLook::screens(), PageLook::nameOf);

} // namespace lumora
