#include "session/lab/ClientProfile.h"

#include "session/lab/Deployment.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

// Entries from withDefault on keep their value unless the file gives one.
template <std::size_t N>
void setSizes(std::array<QString, N>& sizes, const std::array<QString, N>& given, std::size_t withDefault) {
    for (std::size_t i = 0; i < N; ++i) {
        if (i < withDefault || !given[i].isEmpty())
            sizes[i] = given[i];
    }
}

} // namespace

void LoadDefaultProfile(SessionState& state, const Deployment& deployment) {
    ClientProfile profile = deployment.profile;
    profile.ServerKey = state.profile.ServerKey;
    profile.SizeList = state.profile.SizeList;
    profile.QuickSizes = state.profile.QuickSizes;
    setSizes(profile.SizeList, deployment.profile.SizeList, 9);
    setSizes(profile.QuickSizes, deployment.profile.QuickSizes, 2);
    if (profile.PriceListUrl.isEmpty())
        profile.PriceListUrl = profile.SiteUrl + u"album_pricelist"_s;
    profile.PriceListUrl2 = profile.PriceListUrl;
    // The site's address ends in a slash; these addresses have two slashes in a row.
    profile.AdUrl1 = profile.SiteUrl + u"/ad01.jpg"_s;
    profile.AdUrl2 = profile.SiteUrl + u"/ad02.jpg"_s;
    // The installation places these pictures in a folder without "2000" in front, unlike the workspace.
    profile.AdFile1 = state.DiskRoot / u"lumora\\zmany\\ad01.jpg";
    profile.AdFile2 = state.DiskRoot / u"lumora\\zmany\\ad02.jpg";
    state.profile = std::move(profile);

    state.MediniyutDchisa = deployment.MediniyutDchisa;
    state.DchisatAlbum = deployment.DchisatAlbum;
    state.TachanaMekomit = deployment.TachanaMekomit;
    state.DoarReshut = deployment.DoarReshut;
    state.FitMuzag = deployment.FitMuzag;
    state.GvulMuzag = deployment.GvulMuzag;
    state.DegelEdit = deployment.OperatorEditor;
    state.MinuyPaar = deployment.MinuyPaar;
    state.TmunatPaar = deployment.TmunatPaar;
    state.SplitPage = deployment.SplitPage;
    state.Careful = deployment.Careful;
    state.door = deployment.door;
    state.OperatorArea = deployment.OperatorArea;
    state.Waiting = deployment.Waiting;
    state.screenKeys = deployment.screenKeys;
    state.kiosk = deployment.kiosk;
    state.texts = deployment.texts;
    state.albumTail = deployment.albumTail;
    state.DeliveryChoiceMode = deployment.DeliveryChoiceMode;
    state.transfer.SugSheliach = deployment.SugSheliach;
    state.transfer.keptFtpSession = deployment.keptFtpSession;
    state.transfer.ftpLines = deployment.ftpLines;
    state.coupon.HaKoopon = deployment.HaKoopon;
    // A limit of 0 would refuse every order of a lab that takes coupons.
    state.coupon.SmallCount = deployment.HaKoopon == 1 ? 220 : 0;
    state.coupon.LargeCount = deployment.HaKoopon == 1 ? 3 : 0;
}

} // namespace lumora
