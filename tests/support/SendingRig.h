#pragma once

#include "support/PageRig.h"

#include <map>

namespace lumora {

// A prepared order on the disk and the session that sends it, over the connection that the test brings.
struct SendingRig : PageRig {
    explicit SendingRig(Internet& line)
        : PageRig(line) {
        state.transfer.OrderFolder = folder();
        ClientProfile& profile = state.profile;
        profile.ClientCode = u"tarvelmond"_s;
        profile.ReportUrl = u"http://192.0.2.10/aaaqamootreport/padd.asp"_s;
        makeFolder(folder());
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

    void write(const QString& leaf, const QByteArray& bytes) { (void)machine.files.writeWhole(local(leaf), bytes); }
    // What the local folder holds by leaf name, without the server's list.
    std::map<QString, QByteArray> localFiles() const {
        std::map<QString, QByteArray> bytes;
        for (const QString& leaf : test.files.names(folder(), u"*.*"_s)) {
            if (leaf != list())
                bytes[leaf] = take(test.files.read(local(leaf)));
        }
        return bytes;
    }
    // False: no state of the order can be written any more.
    void keepsState(bool kept) {
        const DrivePath file = local(u".order"_s);
        if (kept == test.files.folderExists(file))
            (void)(kept ? test.files.removeTree(file) : test.files.removeFile(file));
        if (!kept)
            (void)test.files.makeFolder(file);
    }

    TestPlatform& test = machine;
};

} // namespace lumora
