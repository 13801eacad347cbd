// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/Positions/PositionSource.h"

namespace velmora {

PositionChoice positionChoice(const std::string& text) {
    constexpr std::string_view gpsd = "gpsd";
    using Kind = PositionChoice::Kind;
    if (text == "modem")
        return {Kind::Modem};
    if (text != gpsd && !text.starts_with("gpsd:"))
        return {Kind::File, {}, {}, text};
    PositionChoice choice{Kind::GPSD, "localhost", "2947"};
    std::string_view rest = std::string_view(text).substr(gpsd.size());
    if (rest.empty())
        return choice;
    rest.remove_prefix(1);
    std::size_t end = rest.find(':');
    if (const std::size_t bracket = rest.find(']');
        rest.starts_with('[') && bracket != std::string_view::npos) {
        choice.host = rest.substr(1, bracket - 1);
        end = rest.find(':', bracket);
    } else if (const std::string_view host = rest.substr(0, end); !host.empty()) {
        choice.host = host;
    }
    if (end != std::string_view::npos && end + 1 < rest.size())
        choice.port = rest.substr(end + 1);
    return choice;
}

} // namespace velmora
