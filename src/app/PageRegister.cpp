#include "app/PageRegister.h"

#include "assembly/edited/B3.h"
#include "assembly/plain/Form2.h"
#include "editing/caption/mikledet.h"
#include "editing/editor/BigPics.h"
#include "editing/editor/Form3.h"
#include "editing/editor/gdisave.h"
#include "editing/editor/tFrmNew.h"
#include "editing/redeye/RedI.h"
#include "entry/details/nnn.h"
#include "entry/notice/Havharot.h"
#include "finished/orders/MoogMeret.h"
#include "finished/pieces/SpltForm.h"
#include "platform/Platform.h"
#include "selection/pictures/kyoskNew.h"
#include "session/PageChain.h"
#include "start/hatchala.h"
#include "transfer/ftp/FtpFrm.h"
#include "transfer/http/UploadForm.h"
#include "transfer/report/InetForm.h"
#include "views/Form3/Form3View.h"
#include "views/Havharot/HavharotView.h"
#include "views/MoogMeret/MoogMeretView.h"
#include "views/RedI/RedIView.h"
#include "views/SpltForm/SpltFormView.h"
#include "views/hatchala/hatchalaView.h"
#include "views/kyoskNew/kyoskNewView.h"
#include "views/mikledet/mikledetView.h"
#include "views/nnn/nnnView.h"
#include "views/preparation/B3View.h"
#include "views/preparation/Form2View.h"
#include "views/sending/FtpFrmView.h"
#include "views/sending/UploadFormView.h"
#include "views/tFrmNew/tFrmNewView.h"
#include "views/window/MainWindow.h"

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
