#include "LogGenerator/C2K/LogCodeParsers.h"

#include "LogGenerator/C2K/ActiveSetPilots.h"
#include "LogGenerator/C2K/EVDOStatus.h"
#include "LogGenerator/C2K/FingerC2I.h"
#include "LogGenerator/C2K/ForwardLinkDataRate.h"
#include "LogGenerator/C2K/OneXStatus.h"
#include "LogGenerator/C2K/ReverseLinkDataRate.h"
#include "LogGenerator/C2K/SystemIdentification.h"
#include "LogGenerator/C2K/TrafficFER.h"

namespace velmora::C2K {

namespace {

template <class Parser>
const LogCodeParser* the() {
    static const Parser parser;
    return &parser;
}

} // namespace

std::span<const LogCodeParser* const> logCodeParsers() {
    static const LogCodeParser* const parsers[] = {
        the<FingerC2I>(),  the<EVDOStatus>(), the<ForwardLinkDataRate>(), the<ActiveSetPilots>(),
        the<OneXStatus>(), the<TrafficFER>(), the<ReverseLinkDataRate>(), the<SystemIdentification>(),
    };
    return parsers;
}

const LogCodeParser* parserOfCode(std::uint32_t logCode) {
    for (const LogCodeParser* parser : logCodeParsers())
        if (parser->logCode() == logCode)
            return parser;
    return nullptr;
}

} // namespace velmora::C2K
