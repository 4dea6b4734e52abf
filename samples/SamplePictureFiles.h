#pragma once

#include <QByteArray>
#include <QImage>

#include <array>
#include <optional>
#include <string>
#include <vector>

// Picture files of all kinds, made when they are asked for.
namespace lumora {

// A picture of flat patches, eight across and six down, no two alike: what is measured in their middles knows no edge.
QImage patches(int width, int height);
inline constexpr int patchesAcross = 8;
inline constexpr int patchesDown = 6;
std::vector<QRgb> middlesOf(const QImage& picture, int across = patchesAcross, int down = patchesDown);

QByteArray saved(const QImage& picture, const char* format, int quality = 100);
// The picture as a camera stores it that was held so that the tag says orientation.
QImage heldFor(const QImage& upright, int orientation);

QByteArray exif(int orientation, bool adobeRgb = false, const QByteArray& small = {});
QByteArray jpegWith(const QByteArray& jpeg, const QByteArray& exif, const QByteArray& profile = {}, int part = 60000);
QByteArray pngWith(const QByteArray& png, const std::vector<std::pair<const char*, QByteArray>>& chunks);
QByteArray webPWith(const QByteArray& webP, const QByteArray& exif, const QByteArray& profile);
QByteArray bigEndian(std::initializer_list<unsigned> numbers);
QByteArray gif(const QImage& picture);
QByteArray inksJpeg(const QImage& picture, const QByteArray& profile);

// HEIC or AVIF. Codes are primaries and curve of an nclx.
struct HeifKind {
    bool avif = false;
    QByteArray profile = {};
    std::optional<std::pair<int, int>> codes = {};
    int orientation = 1;
    QByteArray exif = {};
    int small = 0; // the longer side of a second, small picture
    int quality = 95;
    const char* chroma = "444";
};
QByteArray heif(const QImage& picture, const HeifKind& kind);

// Profiles made by LittleCMS.
QByteArray rgbProfile(const std::array<double, 6>& primaries, double gamma);
QByteArray p3Profile();
QByteArray adobeProfile();
QByteArray srgbProfile(const char* name);
QByteArray greyProfile(double gamma);
QByteArray inksProfile();

// One or two files of each kind, by name.
std::vector<std::pair<std::string, QByteArray>> samplePictureFiles();

} // namespace lumora
