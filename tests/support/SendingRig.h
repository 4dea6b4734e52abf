#pragma once

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/TestPlatform.h"

#include <map>

namespace lumora {

// A prepared order on the disk and the session that sends it, over the connection that the test brings.
struct SendingRig {
    explicit SendingRig(Internet& line)
        : test(line) {
        state.DiskRoot = u"C:\\"_path;
        state.transfer.OrderFolder = folder();
        ClientProfile& profile = state.profile;
        profile.ClientCode = u"tarvelmond"_s;
        profile.ReportUrl = u"http://192.0.2.10/aaaqamootreport/padd.asp"_s;
        for (const DrivePath& path : {u"C:\\2000lumora"_path, u"C:\\2000lumora\\!!000"_path, folder()})
            (void)test.files.makeFolder(path);
        write(first(), QByteArray("\xFF\xD8\r\n\n\r\0--OLA_GRAIN--\r\n", 23).repeated(300));
        write(second(), QByteArray("\xFF\xD8\n\n second").repeated(500));
    }

    static QString name() { return u"2026_11_21_KUP_1234^105"_s; }
    static DrivePath folder() { return u"C:\\2000lumora\\!!000"_path / name(); }
    static QString log() { return name() + u".txt"_s; }
    static QString first() { return u"021015GNB0000_03AABB.jpp"_s; }
    static QString second() { return u"111015GNB0001_03AACC.jpp"_s; }
    static QString list() { return u"filelisthom.txt"_s; }
    static DrivePath local(const QString& leaf) { return folder() / leaf; }

    void write(const QString& leaf, const QByteArray& bytes) { (void)test.files.writeWhole(local(leaf), bytes); }
    // What the local folder holds by leaf name, without the server's list.
    std::map<QString, QByteArray> localFiles() const {
        std::map<QString, QByteArray> bytes;
        for (const QString& leaf : test.files.names(folder(), u"*.*"_s)) {
            if (leaf != list())
                bytes[leaf] = *test.files.read(local(leaf));
        }
        return bytes;
    }
    template <class P>
    void registerPage() {
        chain.registerPage(P::pageId, [this] { return std::make_unique<P>(state, test.platform, chain); });
    }

    TestPlatform test;
    SessionState state;
    PageChain chain{test.pump};
};

} // namespace lumora
