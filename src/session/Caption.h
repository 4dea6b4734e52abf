#pragma once

#include "session/Controls.h"

#include <QString>

#include <array>
#include <cstddef>
#include <utility>

namespace lumora {

// What a view shows of one control: a label, a button, a panel, a text box. A check box or an option adds its value.
struct Caption {
    enum class At { Shown, Hidden, Greyed }; // how the control begins

    Caption() = default;
    // A control of a page, entered under its design name.
    Caption(Controls& page, const QString& name, At at = At::Shown)
        : visible(at != At::Hidden)
        , enabled(at != At::Greyed) {
        page.m_entries.push_back({name, this, nullptr});
    }
    Caption(Controls& page, const char16_t* name, At at = At::Shown)
        : Caption(page, QString::fromUtf16(name), at) {}

    QString text;
    bool visible = true;
    bool enabled = true;
    QString hint; // tool tip
};

struct CheckCaption : Caption {
    using Caption::Caption;

    bool checked = false;
};

// The controls of one name that differ by an index: "Picture1(0)", "Picture1(1)", ...
template <typename Control, std::size_t Count>
struct ControlArray : std::array<Control, Count> {
    ControlArray(Controls& page, const QString& name, Caption::At at = Caption::At::Shown)
        : ControlArray(page, name, at, std::make_index_sequence<Count>()) {}
    ControlArray(Controls& page, const char16_t* name, Caption::At at = Caption::At::Shown)
        : ControlArray(page, QString::fromUtf16(name), at) {}

private:
    template <std::size_t... Index>
    ControlArray(Controls& page, const QString& name, Caption::At at, std::index_sequence<Index...>)
        : std::array<Control, Count>{Control(page, QStringLiteral("%1(%2)").arg(name).arg(Index), at)...} {}
};

} // namespace lumora
