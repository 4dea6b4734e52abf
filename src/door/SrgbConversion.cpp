#include "door/SrgbConversion.h"

#include <array>
#include <utility>
#include <vector>

#include <lcms2.h>

namespace lumora {

namespace {

struct ProfileCloser {
    void operator()(void* profile) const { cmsCloseProfile(profile); }
};
using ProfileHandle = std::unique_ptr<void, ProfileCloser>;

struct TransformDeleter {
    void operator()(void* transform) const { cmsDeleteTransform(transform); }
};
using Transform = std::unique_ptr<void, TransformDeleter>;

struct CurveDeleter {
    void operator()(cmsToneCurve* curve) const { cmsFreeToneCurve(curve); }
};

constexpr bool isLittleEndian = Q_BYTE_ORDER == Q_LITTLE_ENDIAN;
constexpr cmsUInt32Number pixelFormat = isLittleEndian ? TYPE_BGRA_8 : TYPE_ARGB_8;

Transform transformOf(cmsHPROFILE source, cmsUInt32Number format, bool withAlpha) {
    const ProfileHandle srgb(cmsCreate_sRGBProfile());
    const cmsUInt32Number flags = cmsFLAGS_BLACKPOINTCOMPENSATION | cmsFLAGS_HIGHRESPRECALC |
                                  (withAlpha ? cmsUInt32Number{cmsFLAGS_COPY_ALPHA} : 0);
    return Transform(cmsCreateTransform(source, format, srgb.get(), pixelFormat, INTENT_PERCEPTUAL, flags));
}

bool isOfDevice(cmsHPROFILE profile) {
    const cmsProfileClassSignature kind = cmsGetDeviceClass(profile);
    return kind == cmsSigInputClass || kind == cmsSigDisplayClass || kind == cmsSigOutputClass ||
           kind == cmsSigColorSpaceClass;
}

bool isDeep(const QImage& picture) {
    return picture.depth() > 32 || picture.format() == QImage::Format_Grayscale16;
}

} // namespace

struct SrgbConversion::Transforms {
    Transform ordinary; // of pixels as in memory; of greys 16 bits and alpha
    Transform deep;     // of 16 bits a channel
};

std::optional<SrgbConversion> SrgbConversion::ofProfile(const QByteArray& profile, Pixels pixels) {
    const ProfileHandle source(
        cmsOpenProfileFromMem(profile.constData(), static_cast<cmsUInt32Number>(profile.size())));
    if (!source || !isOfDevice(source.get()))
        return {};
    const cmsColorSpaceSignature space = cmsGetColorSpace(source.get());
    SrgbConversion conversion;
    conversion.m_pixels = pixels;
    conversion.m_grey = space == cmsSigGrayData;
    auto transforms = std::make_shared<Transforms>();
    if (pixels == Pixels::Rgb && conversion.m_grey) {
        transforms->ordinary = transformOf(source.get(), TYPE_GRAYA_16, true);
    } else if (pixels == Pixels::Rgb && space == cmsSigRgbData) {
        transforms->ordinary = transformOf(source.get(), pixelFormat, true);
        transforms->deep = transformOf(source.get(), TYPE_RGBA_16, true);
    } else if (pixels != Pixels::Rgb && space == cmsSigCmykData) {
        transforms->ordinary = transformOf(source.get(), pixels == Pixels::Cmyk ? TYPE_CMYK_8 : TYPE_CMYK_8_REV, false);
    }
    if (!transforms->ordinary)
        return {};
    conversion.m_transforms = std::move(transforms);
    return conversion;
}

std::optional<SrgbConversion> SrgbConversion::ofColours(const PictureColours& colours) {
    const cmsCIExyY white{colours.white.x, colours.white.y, 1};
    const auto light = [&colours](std::size_t i) {
        return cmsCIExyY{colours.primaries[i].x, colours.primaries[i].y, 1};
    };
    const cmsCIExyYTRIPLE primaries{light(0), light(1), light(2)};
    // gamma, a, b, c and d of lcms' fourth form: light is (a v + b) ^ gamma from d on, c v below.
    constexpr std::array<double, 5> srgb{2.4, 1 / 1.055, 0.055 / 1.055, 1 / 12.92, 0.04045};
    constexpr std::array<double, 5> rec709{1 / 0.45, 1 / 1.099, 0.099 / 1.099, 1 / 4.5, 0.081};
    using Curve = PictureColours::Curve;
    const std::unique_ptr<cmsToneCurve, CurveDeleter> curve(
        colours.curve == Curve::Gamma
            ? cmsBuildGamma(nullptr, colours.gamma)
            : cmsBuildParametricToneCurve(nullptr, 4, (colours.curve == Curve::Srgb ? srgb : rec709).data()));
    const std::array<cmsToneCurve*, 3> curves{curve.get(), curve.get(), curve.get()};
    const ProfileHandle source(curve ? cmsCreateRGBProfile(&white, &primaries, curves.data()) : nullptr);
    if (!source)
        return {};
    auto transforms = std::make_shared<Transforms>();
    transforms->ordinary = transformOf(source.get(), pixelFormat, true);
    transforms->deep = transformOf(source.get(), TYPE_RGBA_16, true);
    if (!transforms->ordinary)
        return {};
    SrgbConversion conversion;
    conversion.m_transforms = std::move(transforms);
    return conversion;
}

QImage SrgbConversion::converted(QImage picture) const {
    const bool alpha = m_pixels == Pixels::Rgb && picture.hasAlphaChannel();
    const bool deep = m_pixels == Pixels::Rgb && (m_grey || isDeep(picture));
    const QImage::Format format = alpha ? QImage::Format_ARGB32 : QImage::Format_RGB32;
    picture.convertTo(deep ? QImage::Format_RGBA64 : format);
    if (picture.isNull())
        return {};
    // Pixels of one size are converted in place.
    QImage result = deep ? QImage(picture.size(), format) : picture;
    if (!deep)
        picture = QImage();
    std::vector<quint16> greys(m_grey ? static_cast<std::size_t>(result.width()) * 2 : 0);
    const auto width = static_cast<cmsUInt32Number>(result.width());
    for (int y = 0; y < result.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(result.scanLine(y));
        const void* stored = deep ? picture.constScanLine(y) : result.constScanLine(y);
        if (m_grey) {
            const auto* pixels = static_cast<const QRgba64*>(stored);
            for (std::size_t x = 0; x < width; ++x) {
                greys[2 * x] = pixels[x].green();
                greys[2 * x + 1] = pixels[x].alpha();
            }
            stored = greys.data();
        }
        cmsDoTransform((deep && !m_grey ? m_transforms->deep : m_transforms->ordinary).get(), stored, line, width);
        for (cmsUInt32Number x = 0; !alpha && x < width; ++x)
            line[x] |= 0xFF000000;
    }
    return result;
}

} // namespace lumora
