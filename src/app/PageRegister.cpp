#include "app/PageRegister.h"

#include "assembly/B3.h"
#include "assembly/Form2.h"
#include "editing/BigPics.h"
#include "editing/Form3.h"
#include "editing/RedI.h"
#include "editing/gdisave.h"
#include "editing/mikledet.h"
#include "editing/tFrmNew.h"
#include "entry/Havharot.h"
#include "entry/nnn.h"
#include "finished/MoogMeret.h"
#include "finished/SpltForm.h"
#include "platform/Platform.h"
#include "selection/kyoskNew.h"
#include "session/PageChain.h"
#include "session/hatchala.h"
#include "transfer/FtpFrm.h"
#include "transfer/InetForm.h"
#include "transfer/UploadForm.h"
#include "views/B3View.h"
#include "views/Form2View.h"
#include "views/Form3View.h"
#include "views/FtpFrmView.h"
#include "views/HavharotView.h"
#include "views/MainWindow.h"
#include "views/MoogMeretView.h"
#include "views/RedIView.h"
#include "views/SpltFormView.h"
#include "views/UploadFormView.h"
#include "views/hatchalaView.h"
#include "views/kyoskNewView.h"
#include "views/mikledetView.h"
#include "views/nnnView.h"
#include "views/tFrmNewView.h"

namespace lumora {

void registerPages(PageChain& chain, SessionState& state, const Platform& platform, const Deployment& deployment) {
    chain.registerPage(PageId::hatchala,
                       [&] { return std::make_unique<hatchala>(state, platform, chain, deployment); });
    chain.registerPage(PageId::nnn, [&] { return std::make_unique<nnn>(state, platform, chain); });
    chain.registerPage(PageId::Havharot, [&] { return std::make_unique<Havharot>(state, platform, chain); });
    chain.registerPage(PageId::kyoskNew, [&] { return std::make_unique<kyoskNew>(state, platform, chain); });
    chain.registerPage(PageId::gdisave, [&] { return std::make_unique<gdisave>(state, platform, chain); });
    chain.registerPage(PageId::tFrmNew, [&] { return std::make_unique<tFrmNew>(state, platform, chain); });
    chain.registerPage(PageId::BigPics, [] { return std::make_unique<BigPics>(); });
    chain.registerPage(PageId::Form3, [&] { return std::make_unique<Form3>(state, platform, chain); });
    chain.registerPage(PageId::RedI, [&] { return std::make_unique<RedI>(state, platform, chain); });
    chain.registerPage(PageId::mikledet, [&] { return std::make_unique<mikledet>(state, platform, chain); });
    chain.registerPage(PageId::B3, [&] { return std::make_unique<B3>(state, platform, chain); });
    chain.registerPage(PageId::Form2, [&] { return std::make_unique<Form2>(state, platform, chain); });
    chain.registerPage(PageId::FtpFrm, [&] { return std::make_unique<FtpFrm>(state, platform, chain); });
    chain.registerPage(PageId::UploadForm, [&] { return std::make_unique<UploadForm>(state, platform, chain); });
    chain.registerPage(PageId::MoogMeret, [&] { return std::make_unique<MoogMeret>(state, platform, chain); });
    chain.registerPage(PageId::InetForm, [&] { return std::make_unique<InetForm>(state, platform, chain); });
    chain.registerPage(PageId::SpltForm, [&] { return std::make_unique<SpltForm>(state, platform, chain); });
}

void registerViews(MainWindow& window, PageChain& chain, SessionState& state, const Files& files) {
    // A view is made for the page that its id stands for, so the page is of that class.
    window.registerView(PageId::hatchala, [&](Page& page, const Theme& theme) {
        return std::make_unique<hatchalaView>(static_cast<hatchala&>(page), state, theme, files);
    });
    window.registerView(PageId::nnn, [&](Page& page, const Theme& theme) {
        return std::make_unique<nnnView>(static_cast<nnn&>(page), state, theme);
    });
    window.registerView(PageId::Havharot, [&](Page& page, const Theme& theme) {
        return std::make_unique<HavharotView>(static_cast<Havharot&>(page), state, theme);
    });
    window.registerView(PageId::kyoskNew, [&](Page& page, const Theme& theme) {
        return std::make_unique<kyoskNewView>(static_cast<kyoskNew&>(page), state, theme);
    });
    window.registerView(PageId::mikledet, [&](Page& page, const Theme& theme) {
        return std::make_unique<mikledetView>(static_cast<mikledet&>(page), state, theme);
    });
    window.registerView(PageId::B3, [&](Page& page, const Theme& theme) {
        return std::make_unique<B3View>(static_cast<B3&>(page), state, theme);
    });
    window.registerView(PageId::tFrmNew, [&](Page& page, const Theme& theme) {
        return std::make_unique<tFrmNewView>(static_cast<tFrmNew&>(page), chain, state, theme);
    });
    window.registerView(PageId::Form2, [&](Page& page, const Theme& theme) {
        return std::make_unique<Form2View>(static_cast<Form2&>(page), state, theme);
    });
    window.registerView(PageId::Form3, [&](Page& page, const Theme& theme) {
        return std::make_unique<Form3View>(static_cast<Form3&>(page), state, theme);
    });
    window.registerView(PageId::RedI, [&](Page& page, const Theme& theme) {
        return std::make_unique<RedIView>(static_cast<RedI&>(page), state, theme);
    });
    window.registerView(PageId::UploadForm, [&](Page& page, const Theme& theme) {
        return std::make_unique<UploadFormView>(static_cast<UploadForm&>(page), state, theme);
    });
    window.registerView(PageId::FtpFrm, [&](Page& page, const Theme& theme) {
        return std::make_unique<FtpFrmView>(static_cast<FtpFrm&>(page), state, theme, files);
    });
    window.registerView(PageId::MoogMeret, [&](Page& page, const Theme& theme) {
        return std::make_unique<MoogMeretView>(static_cast<MoogMeret&>(page), state, theme);
    });
    window.registerView(PageId::SpltForm, [&](Page& page, const Theme& theme) {
        return std::make_unique<SpltFormView>(static_cast<SpltForm&>(page), state, theme);
    });
}

} // namespace lumora
