#pragma once

#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/Take.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>

namespace lumora {

// What the test of a page needs: a fresh machine, the session, and the chain with the pages that the test names.
struct PageRig {
    PageRig() { state.DiskRoot = machine.drives.programRoot(); }
    // The same with a line.
    explicit PageRig(Internet& line)
        : machine(line) {
        state.DiskRoot = machine.drives.programRoot();
    }

    template <class P>
    void registerPage(PageId id) {
        chain.registerPage(id, [this] { return std::make_unique<P>(state, machine.platform, chain); });
    }
    // Pages that are only shown.
    void registerBare(std::initializer_list<PageId> ids) {
        for (const PageId id : ids)
            chain.registerPage(id, [id] { return std::make_unique<Page>(id); });
    }
    void write(const DrivePath& path, const QByteArray& bytes) const {
        EXPECT_TRUE(machine.files.writeWhole(path, bytes)) << path.text().toStdString();
    }
    QByteArray read(const DrivePath& path) const {
        const auto bytes = machine.files.read(path);
        return bytes ? *bytes : QByteArrayLiteral("can't be read");
    }
    void makeFolder(const auto& path) { std::filesystem::create_directories(host(path)); }
    HostPath host(const DrivePath& path) const { return *machine.drives.toHost(path); }
    HostPath host(const QString& path) const { return host(DrivePath(path)); }

    TestPlatform machine;
    SessionState state;
    PageChain chain{machine.pump};
};

} // namespace lumora
