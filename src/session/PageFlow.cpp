#include "session/PageFlow.h"

#include <algorithm>

namespace lumora {

const std::vector<PageWay>& pageFlow() {
    using enum PageId;
    using enum Outcome;
    using enum PageWay::From;
    // An edited order goes by the sender that the lab has set; a plain one goes by FTP, always.
    static const std::vector<PageWay> ways = {
        {hatchala, OrderBegun, nnn, IsLeft},
        {hatchala, SendingWanted, FtpFrm, Waits},
        {hatchala, PlainTakenUp, Form2, IsLeft},
        {hatchala, EditedTakenUp, B3, IsLeft},
        {hatchala, SendingTakenUpByFtp, FtpFrm, IsLeft},
        {hatchala, SendingTakenUpByHttp, UploadForm, IsLeft},

        {nnn, PicturesWanted, kyoskNew, IsLeft},
        {nnn, FinishedWanted, MoogMeret, IsLeft},
        {nnn, NoticeWanted, Havharot, Waits},
        {nnn, NoticeAlone, Havharot, IsLeft},
        {nnn, NewOrderWanted, hatchala, IsLeft},

        {kyoskNew, EditorWanted, tFrmNew, Waits},
        {kyoskNew, TurnedWanted, Form3, Waits},
        {kyoskNew, DetailsWanted, nnn, Waits},
        {kyoskNew, PlainChosen, Form2, IsLeft},
        {kyoskNew, EditedChosen, B3, IsLeft},

        {tFrmNew, CaptionWanted, mikledet, Waits},
        {tFrmNew, RedEyesWanted, RedI, Waits},
        {tFrmNew, EditingDone, kyoskNew, Waits},
        {mikledet, EditingDone, tFrmNew, Waits},

        {Form2, PreparedForFtp, FtpFrm, IsLeft},
        {Form2, PreparedForLater, MoogMeret, IsLeft},
        {Form2, KeptAtStation, hatchala, IsLeft},
        {Form2, PicturesWanted, kyoskNew, IsLeft},
        {Form2, NewOrderWanted, hatchala, IsLeft},
        {B3, PreparedForFtp, FtpFrm, IsLeft},
        {B3, PreparedForHttp, UploadForm, IsLeft},
        {B3, KeptAtStation, hatchala, IsLeft},
        {B3, PicturesWanted, kyoskNew, IsLeft},
        {B3, NewOrderWanted, hatchala, IsLeft},

        {FtpFrm, NewOrderWanted, hatchala, IsLeft},
        {UploadForm, NewOrderWanted, hatchala, IsLeft},
        {FtpFrm, PicturesWanted, kyoskNew, IsLeft},
        {UploadForm, PicturesWanted, kyoskNew, IsLeft},
        {FtpFrm, PlainTakenUp, Form2, IsLeft},
        {FtpFrm, EditedTakenUp, B3, IsLeft},
        {UploadForm, PlainTakenUp, Form2, IsLeft},
        {UploadForm, EditedTakenUp, B3, IsLeft},

        {MoogMeret, ResentByFtp, FtpFrm, IsLeft},
        {MoogMeret, ResentByHttp, UploadForm, IsLeft},
        {MoogMeret, PlainTakenUp, Form2, IsLeft},
        {MoogMeret, EditedTakenUp, B3, IsLeft},
        {MoogMeret, SendingTakenUpByFtp, FtpFrm, IsLeft},
        {MoogMeret, SendingTakenUpByHttp, UploadForm, IsLeft},
        {MoogMeret, PiecesWanted, SpltForm, Waits},
        {MoogMeret, NewOrderWanted, hatchala, IsLeft},
        {SpltForm, PiecesDone, MoogMeret, IsLeft},
    };
    return ways;
}

std::optional<PageWay> wayFrom(PageId from, Outcome outcome) {
    const auto& ways = pageFlow();
    const auto at = std::find_if(ways.begin(), ways.end(),
                                 [&](const PageWay& way) { return way.from == from && way.outcome == outcome; });
    return at == ways.end() ? std::nullopt : std::optional(*at);
}

} // namespace lumora
