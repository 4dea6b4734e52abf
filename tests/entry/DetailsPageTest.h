#pragma once

#include "entry/details/nnn.h"
#include "entry/notice/Havharot.h"
#include "session/lab/ClientProfile.h"
#include "session/lab/Deployment.h"
#include "support/PageRig.h"

#include <gtest/gtest.h>

namespace lumora {

// The details page with bare pages on both sides of it.
class DetailsPageTest : public ::testing::Test, protected PageRig {
protected:
    DetailsPageTest() {
        state.KodMishloach = u"KUP"_s;
        registerBare({PageId::hatchala, PageId::kyoskNew, PageId::MoogMeret});
        registerPage<Havharot>(PageId::Havharot);
        registerPage<nnn>(PageId::nnn);
    }

    nnn& start() {
        LoadDefaultProfile(state, deployment);
        machine.dialogs.messages.clear();
        chain.show(PageId::nnn);
        return static_cast<nnn&>(*chain.front());
    }

    const DrivePath customerStore = u"C:\\2000lumora\\pratim.txt"_path;
    Deployment deployment;
};

} // namespace lumora
