// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/LogCodeParsers.h"

#include "LogGenerator/C2K/EVDO/ActiveSetPilots.h"
#include "LogGenerator/C2K/EVDO/EVDOStatus.h"
#include "LogGenerator/C2K/EVDO/FingerC2I.h"
#include "LogGenerator/C2K/EVDO/ForwardLinkDataRate.h"
#include "LogGenerator/C2K/EVDO/ReverseLinkDataRate.h"
#include "LogGenerator/C2K/OneX/OneXStatus.h"
#include "LogGenerator/C2K/OneX/SystemIdentification.h"
#include "LogGenerator/C2K/OneX/TrafficFER.h"

#include <algorithm>
#include <array>
#include <cstddef>

namespace velmora::C2K {

namespace {

constexpr std::size_t parserCount = 8;

template <class Parser>
const LogCodeParser* the() {
    static const Parser parser;
    return &parser;
}

} // namespace

std::span<const LogCodeParser* const> logCodeParsers() {
    static const std::array<const LogCodeParser*, parserCount> parsers = {
        the<FingerC2I>(),  the<EVDOStatus>(), the<ForwardLinkDataRate>(), the<ActiveSetPilots>(),
        the<OneXStatus>(), the<TrafficFER>(), the<ReverseLinkDataRate>(), the<SystemIdentification>(),
    };
    return parsers;
}

std::size_t indexOf(const LogCodeParser& parser) {
    const std::span<const LogCodeParser* const> all = logCodeParsers();
    return static_cast<std::size_t>(std::find(all.begin(), all.end(), &parser) - all.begin());
}

const LogCodeParser* parserOfCode(std::uint32_t logCode) {
    static const auto codes = [] {
        std::array<std::uint32_t, parserCount> result{};
        std::transform(logCodeParsers().begin(), logCodeParsers().end(), result.begin(),
                       [](const LogCodeParser* parser) { return parser->logCode(); });
        return result;
    }();
    const auto found = std::find(codes.begin(), codes.end(), logCode);
    return found == codes.end() ? nullptr : logCodeParsers()[static_cast<std::size_t>(found - codes.begin())];
}

} // namespace velmora::C2K
