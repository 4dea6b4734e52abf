#pragma once

namespace lumora {

// What a lab lets through its door, [Door] of its file. Built in, .jpg files alone are offered, and used as they lie.
struct DoorRules {
    bool everyFormat = false; // all kinds of pictures are offered; else .jpg
    bool upright = false;     // a JPEG that its EXIF turns goes through the door
    bool srgb = false;        // and so does one of other colours

    bool any() const { return everyFormat || upright || srgb; }
    bool operator==(const DoorRules&) const = default;
};

} // namespace lumora
