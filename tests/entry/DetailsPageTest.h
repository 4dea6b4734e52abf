#pragma once

#include "entry/Havharot.h"
#include "entry/nnn.h"
#include "session/ClientProfile.h"
#include "session/Deployment.h"
#include "session/PageChain.h"
#include "session/SessionState.h"
#include "support/TestPlatform.h"

#include <gtest/gtest.h>

#include <memory>

namespace lumora {

using namespace Qt::StringLiterals;

// The details page with bare pages on both sides of it.
class DetailsPageTest : public ::testing::Test {
protected:
    DetailsPageTest() {
        state.DiskRoot = machine.drives.programRoot();
        state.KodMishloach = u"KUP"_s;
        for (const PageId id : {PageId::hatchala, PageId::kyoskNew, PageId::MoogMeret})
            chain.registerPage(id, [id] { return std::make_unique<Page>(id); });
        chain.registerPage(PageId::Havharot,
                           [this] { return std::make_unique<Havharot>(state, machine.platform, chain); });
        chain.registerPage(PageId::nnn, [this] { return std::make_unique<nnn>(state, machine.platform, chain); });
    }

    nnn& start() {
        LoadDefaultProfile(state, deployment);
        machine.dialogs.messages.clear();
        chain.show(PageId::nnn);
        return static_cast<nnn&>(*chain.front());
    }

    const QString customerStore = u"C:\\2000lumora\\pratim.txt"_s;
    TestPlatform machine;
    SessionState state;
    Deployment deployment;
    PageChain chain{machine.pump};
};

} // namespace lumora
