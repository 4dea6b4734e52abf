#pragma once

#include "editing/editor/BigPics.h"
#include "editing/editor/tFrmNew.h"
#include "imaging/files/PictureFile.h"
#include "selection/pictures/kyoskNew.h"
#include "session/Workspace.h"
#include "support/PageRig.h"

#include <QElapsedTimer>
#include <QGuiApplication>

#include <gtest/gtest.h>

#include <functional>

namespace lumora {

// The page of pictures in an order of prints, with the editor above it and bare pages beside it.
class ThePage : public testing::Test, protected PageRig {
protected:
    ThePage() {
        state.shemot.ppr = u"10/15"_s;
        state.shemot.maat = u"מבריק"_s;
        state.shemot.Bord = u"NB"_s;
        state.Optint = OrderKind::Print;
        registerPage<kyoskNew>(PageId::kyoskNew);
        registerPage<tFrmNew>(PageId::tFrmNew);
        chain.registerPage(PageId::BigPics, [] { return std::make_unique<BigPics>(); });
        registerBare({PageId::hatchala, PageId::Form2, PageId::B3});
        EXPECT_TRUE(Workspace(state, machine.files).MakeWorkspace());
    }

    kyoskNew& open() {
        chain.show(PageId::kyoskNew);
        return *chain.find<kyoskNew>();
    }
    void pick(kyoskNew& page, const QString& picture) {
        machine.dialogs.picks += DrivePath(picture);
        page.Image5_Click();
    }
    static void waitUntil(const std::function<bool()>& done) {
        QElapsedTimer clock;
        for (clock.start(); !done() && clock.elapsed() < 60'000;)
            QGuiApplication::processEvents(QEventLoop::AllEvents, 50);
        ASSERT_TRUE(done());
    }
};

} // namespace lumora
