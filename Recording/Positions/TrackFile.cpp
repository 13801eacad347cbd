// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Positions/TrackFile.h"

#include <algorithm>
#include <utility>

namespace velmora {

std::size_t lineAt(std::string_view content, std::size_t offset) {
    const std::string_view before = content.substr(0, offset);
    return static_cast<std::size_t>(std::count(before.begin(), before.end(), '\n')) + 1;
}

Result<std::vector<Fix>> fixesOfTrackFile(std::string_view content) {
    constexpr std::string_view byteOrderMark = "\xEF\xBB\xBF";
    if (content.starts_with(byteOrderMark))
        content.remove_prefix(byteOrderMark.size());
    const std::size_t begin = std::min(content.find_first_not_of(" \t\r\n"), content.size());
    if (begin == content.size())
        return Failure{"empty, wanted GPX or NMEA sentences"};
    const bool isXML = content.substr(begin).starts_with('<');
    Result<std::vector<Fix>> fixes = isXML ? fixesOfGPX(content) : fixesOfNMEA(content);
    if (fixes)
        std::stable_sort(fixes->begin(), fixes->end(),
                         [](const Fix& a, const Fix& b) { return a.time < b.time; });
    return fixes;
}

} // namespace velmora
