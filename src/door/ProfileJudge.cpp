#include "door/ProfileJudge.h"

#include <QtEndian>

#include <algorithm>
#include <array>
#include <cmath>
#include <optional>

namespace lumora {

namespace {

class Profile {
public:
    explicit Profile(QByteArrayView bytes)
        : m_bytes(bytes) {}

    bool isWhole() const {
        const qint64 stated = number(0);
        return m_bytes.size() >= headerSize + 4 && part(36, 4) == "acsp" && stated <= m_bytes.size() &&
               tagCount() >= 1 && tagCount() <= 200 && headerSize + 4 + tagCount() * 12 <= m_bytes.size();
    }
    bool isMatrixOfLight() const { return part(16, 4) == "RGB " && part(20, 4) == "XYZ " && tag("A2B0").isEmpty(); }

    // The content of a tag; nothing where it is missing or reaches beyond the profile.
    QByteArrayView tag(QByteArrayView name) const {
        for (qint64 i = 0; i < tagCount(); ++i) {
            const qint64 entry = headerSize + 4 + i * 12;
            if (part(entry, 4) == name)
                return part(number(entry + 4), number(entry + 8));
        }
        return {};
    }

private:
    static constexpr qint64 headerSize = 128;

    QByteArrayView part(qint64 at, qint64 count) const {
        return at >= 0 && count >= 0 && at + count <= m_bytes.size() ? m_bytes.sliced(at, count) : QByteArrayView();
    }
    qint64 number(qint64 at) const {
        const QByteArrayView bytes = part(at, 4);
        return bytes.isEmpty() ? 0 : qFromBigEndian<quint32>(bytes.data());
    }
    qint64 tagCount() const { return number(headerSize); }

    QByteArrayView m_bytes;
};

double fixed(QByteArrayView bytes, qsizetype at) {
    return qFromBigEndian<qint32>(bytes.data() + at) / 65536.0;
}

double encodedSrgb(double light) {
    return light <= 0.0031308 ? 12.92 * light : 1.055 * std::pow(light, 1 / 2.4) - 0.055;
}

// The light of a value from 0 to 1 by a curve of parameters: five forms, each with more of them than the last.
std::optional<double> lightByFormula(QByteArrayView curve, double value) {
    constexpr std::array<qsizetype, 5> counts{1, 3, 4, 5, 7};
    const unsigned form = curve.size() >= 12 ? qFromBigEndian<quint16>(curve.data() + 8) : 5;
    if (form >= counts.size() || curve.size() < 12 + counts[form] * 4)
        return {};
    std::array<double, 7> p{1, 1, 0, 0, 0, 0, 0}; // g a b c d e f
    for (qsizetype i = 0; i < counts[form]; ++i)
        p[static_cast<std::size_t>(i)] = fixed(curve, 12 + 4 * i);
    const double base = p[1] * value + p[2];
    const double power = base > 0 ? std::pow(base, p[0]) : 0;
    switch (form) {
    case 0:
        return power;
    case 1:
    case 2:
        return base >= 0 ? power + p[3] : p[3];
    default:
        return value >= p[4] ? power + p[5] : p[3] * value + p[6];
    }
}

std::optional<double> lightByTable(QByteArrayView curve, double value) {
    const qint64 count = curve.size() >= 12 ? qFromBigEndian<quint32>(curve.data() + 8) : -1;
    if (count < 0 || 12 + count * 2 > curve.size())
        return {};
    const auto entry = [curve](qint64 i) { return qFromBigEndian<quint16>(curve.data() + 12 + 2 * i); };
    if (count == 0)
        return value;
    if (count == 1)
        return std::pow(value, entry(0) / 256.0);
    const double place = value * double(count - 1);
    const auto below = std::min(static_cast<qint64>(place), count - 2);
    const double share = place - double(below);
    return (entry(below) * (1 - share) + entry(below + 1) * share) / 65535;
}

bool hasSrgbCurve(QByteArrayView curve) {
    constexpr double tolerance = 1.5 / 255;
    constexpr int steps = 32;
    for (int i = 0; i <= steps; ++i) {
        const double value = double(i) / steps;
        const auto light = curve.startsWith("para")   ? lightByFormula(curve, value)
                           : curve.startsWith("curv") ? lightByTable(curve, value)
                                                      : std::nullopt;
        if (!light || !(std::abs(encodedSrgb(*light) - value) <= tolerance))
            return false;
    }
    return true;
}

bool hasPrimary(QByteArrayView tag, const std::array<double, 3>& wanted) {
    constexpr double tolerance = 0.003;
    if (!tag.startsWith("XYZ ") || tag.size() < 20)
        return false;
    for (std::size_t i = 0; i < wanted.size(); ++i)
        if (std::abs(fixed(tag, 8 + 4 * static_cast<qsizetype>(i)) - wanted[i]) > tolerance)
            return false;
    return true;
}

} // namespace

ProfileVerdict judgeProfile(QByteArrayView bytes) {
    const Profile profile(bytes);
    if (!profile.isWhole())
        return ProfileVerdict::Broken;
    // sRGB's primaries under the light of day of profiles, D50.
    const bool isSrgb = profile.isMatrixOfLight() && hasPrimary(profile.tag("rXYZ"), {0.4361, 0.2225, 0.0139}) &&
                        hasPrimary(profile.tag("gXYZ"), {0.3851, 0.7169, 0.0971}) &&
                        hasPrimary(profile.tag("bXYZ"), {0.1431, 0.0606, 0.7141}) &&
                        hasSrgbCurve(profile.tag("rTRC")) && hasSrgbCurve(profile.tag("gTRC")) &&
                        hasSrgbCurve(profile.tag("bTRC"));
    return isSrgb ? ProfileVerdict::Srgb : ProfileVerdict::Other;
}

} // namespace lumora
