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
namespace {

// A view is made for the page that its id stands for, so the page is of that class.
template <class View, class P, class... More>
MainWindow::ViewMaker viewOf(const SessionState& state, const More&... more) {
    return [&state, &more...](Page& page, const Theme& theme) {
        return std::make_unique<View>(static_cast<P&>(page), state, theme, more...);
    };
}

} // namespace

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
    window.registerView(PageId::hatchala, viewOf<hatchalaView, hatchala>(state, files));
    window.registerView(PageId::nnn, viewOf<nnnView, nnn>(state));
    window.registerView(PageId::Havharot, viewOf<HavharotView, Havharot>(state));
    window.registerView(PageId::kyoskNew, viewOf<kyoskNewView, kyoskNew>(state));
    window.registerView(PageId::mikledet, viewOf<mikledetView, mikledet>(state));
    window.registerView(PageId::B3, viewOf<B3View, B3>(state));
    window.registerView(PageId::tFrmNew, [&](Page& page, const Theme& theme) {
        return std::make_unique<tFrmNewView>(static_cast<tFrmNew&>(page), chain, state, theme);
    });
    window.registerView(PageId::Form2, viewOf<Form2View, Form2>(state));
    window.registerView(PageId::Form3, viewOf<Form3View, Form3>(state));
    window.registerView(PageId::RedI, viewOf<RedIView, RedI>(state));
    window.registerView(PageId::UploadForm, viewOf<UploadFormView, UploadForm>(state));
    window.registerView(PageId::FtpFrm, viewOf<FtpFrmView, FtpFrm>(state, files));
    window.registerView(PageId::MoogMeret, viewOf<MoogMeretView, MoogMeret>(state));
    window.registerView(PageId::SpltForm, viewOf<SpltFormView, SpltForm>(state));
}

} // namespace lumora
