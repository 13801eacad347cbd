// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Technologies/Technologies.h"

#include <algorithm>
#include <ostream>

namespace velmora {

ExpectedSection simInfo(const Base* (*field)(const ClassIndex&)) {
    return {"SIM Info", field, {0xFF0000}, "SimInfo"};
}

ExpectedSection contextList(const Base* (*field)(const ClassIndex&)) {
    return {"PDP Context Info", field, {0xFF0002}, "PDPContextList"};
}

std::vector<ExpectedSection> Technology::subscribers(std::uint32_t code) const {
    std::vector<ExpectedSection> found;
    for (const ExpectedSection& section : sections)
        if (std::find(section.codes.begin(), section.codes.end(), code) != section.codes.end())
            found.push_back(section);
    return found;
}

std::set<std::uint32_t> Technology::codes() const {
    std::set<std::uint32_t> all;
    for (const ExpectedSection& section : sections)
        all.insert(section.codes.begin(), section.codes.end());
    return all;
}

void PrintTo(const Technology& technology, std::ostream* out) {
    *out << technology.name;
}

const std::vector<Technology>& technologies() {
    static const std::vector<Technology> all = {expectedLTE(), expectedModem(), expectedOstrelGSM(),
                                                expectedUTRAN()};
    return all;
}

} // namespace velmora
