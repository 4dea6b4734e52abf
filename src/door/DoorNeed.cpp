#include "door/DoorNeed.h"

#include "door/ProfileJudge.h"

namespace lumora {

using namespace Qt::StringLiterals;

namespace {

using Source = HeaderColours::Source;

constexpr int unspecified = 2;

struct CodedPrimaries {
    int code;
    Chromaticity white;
    std::array<Chromaticity, 3> primaries;
};

constexpr Chromaticity d65{0.3127, 0.3290};
constexpr CodedPrimaries codedPrimaries[] = {
    {4, {0.310, 0.316}, {{{0.67, 0.33}, {0.21, 0.71}, {0.14, 0.08}}}},
    {5, d65, {{{0.64, 0.33}, {0.29, 0.60}, {0.15, 0.06}}}},
    {6, d65, {{{0.630, 0.340}, {0.310, 0.595}, {0.155, 0.070}}}},
    {7, d65, {{{0.630, 0.340}, {0.310, 0.595}, {0.155, 0.070}}}},
    {9, d65, {{{0.708, 0.292}, {0.170, 0.797}, {0.131, 0.046}}}},
    {11, {0.314, 0.351}, {{{0.680, 0.320}, {0.265, 0.690}, {0.150, 0.060}}}},
    {12, d65, {{{0.680, 0.320}, {0.265, 0.690}, {0.150, 0.060}}}},
    {22, d65, {{{0.630, 0.340}, {0.295, 0.605}, {0.155, 0.077}}}},
};

HeaderColours named(const PictureColours& colours) {
    return {Source::Named, colours, false};
}

} // namespace

HeaderColours codedColours(PictureHeader::CodedColours coded) {
    PictureColours colours;
    for (const CodedPrimaries& known : codedPrimaries) {
        if (known.code == coded.primaries) {
            colours.white = known.white;
            colours.primaries = known.primaries;
        }
    }
    using Curve = PictureColours::Curve;
    switch (coded.transfer) {
    case 1:
    case 6:
    case 14:
    case 15:
        colours.curve = Curve::Rec709;
        break;
    case 4:
    case 5:
    case 8:
        colours.curve = Curve::Gamma;
        colours.gamma = coded.transfer == 4 ? 2.2 : coded.transfer == 5 ? 2.8 : 1;
        break;
    case 16:
    case 18:
        return {Source::Hdr, {}, false};
    default:
        break;
    }
    const bool isSrgb = coded.primaries <= unspecified && colours.curve == Curve::Srgb;
    return isSrgb ? HeaderColours() : named(colours);
}

HeaderColours coloursOf(const PictureHeader& header) {
    bool broken = header.profileBroken;
    if (header.coded && header.coded->primaries != unspecified && header.coded->transfer != unspecified)
        return codedColours(*header.coded);
    if (header.packedProfile)
        return {Source::Profile, {}, false};
    if (!header.profile.isEmpty()) {
        const ProfileVerdict verdict = judgeProfile(header.profile);
        if (verdict == ProfileVerdict::Other)
            return {Source::Profile, {}, false};
        if (verdict == ProfileVerdict::Srgb)
            return {};
        broken = true;
    }
    HeaderColours colours = header.named      ? named(*header.named)
                            : header.adobeRgb ? named(adobeRgbColours())
                                              : HeaderColours();
    colours.profileIgnored = broken;
    return colours;
}

DoorNeed doorNeedOf(const PictureHeader& header, const QString& fileName, DoorRules rules) {
    const bool noFrame = header.kind == PictureKind::Jpeg && (header.size.width < 1 || header.size.height < 1);
    if (header.kind == PictureKind::None || noFrame)
        return DoorNeed::Unreadable;
    if (header.kind != PictureKind::Jpeg || (rules.srgb && coloursOf(header).source != Source::None))
        return DoorNeed::Decode;
    if (rules.upright && header.orientation != 1)
        return DoorNeed::Turn;
    return fileName.endsWith(u".jpg"_s) || fileName.endsWith(u".JPG"_s) ? DoorNeed::Nothing : DoorNeed::Copy;
}

} // namespace lumora
