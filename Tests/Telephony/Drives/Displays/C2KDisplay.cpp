// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/Drives/C2KLayouts.h"
#include "Tests/Telephony/Drives/Displays/ExpectedDisplays.h"

namespace velmora {

namespace {

/// The decoder reports every message that is not as its layout says.
bool isUnusual(const Data& message) {
    const auto header = LogMessage::parse(message.bytes());
    return header && c2k::layouts.contains(header->logCode()) &&
           (header->type == 2 || !c2k::isWellFormed(*header));
}

} // namespace

ExpectedDisplay expectedC2KDisplay() {
    using testing::AllOf;
    using testing::Contains;
    using testing::Each;
    using testing::Ge;
    using testing::Le;
    using testing::SizeIs;

    const char* const level = "[+-][0-9]+ dBm|N/A";
    const char* const fineLevel = "[+-][0-9]+\\.[0-9][0-9] dBm|N/A";
    const char* const rate = "[0-9]+\\.[0-9][0-9] kbps";
    const char* const band = "800 MHz cellular band .0.|1.8 to 2.0GHz PCS band .1.";
    const char* const oneXState = "[A-Z].* .[0-9]+.";
    const char* const evdoState = "[A-Z][a-z]+ .[0-5].";
    const char* const roaming = "OFF .0.|Flashing .2.";
    const char* const system = "3200[12]|.unknown system type 0.";
    const char* const network = "[12][12]|.unknown system type 0.";
    // A call and a connection show both chains and the transmitters, which have no value otherwise.
    const auto inCalls = [](const char* expression) {
        return AllOf(changing(expression), Contains("N/A"), SizeIs(Ge(10U)));
    };
    const auto forwardRates =
        AllOf(changing(rate), Each(IsNumber(0, 2500, " kbps")), Contains(IsNumber(500, 2500, " kbps")));
    ExpectedDisplay display;
    display.scenario = "c2k";
    display.templateName = "C2KTemplate";
    display.texts = {
        {"/Overview/1x State", changing(oneXState)},
        {"/Overview/EV-DO State", changing(evdoState)},
        {"/Overview/Roaming Indicator", changing(roaming)},
        {"/Overview/System ID", changing(system)},
        {"/Overview/Network ID", changing(network)},
        {"/Overview/Forward Link Rate", forwardRates},
        {"/Overview/Reverse Link Rate", changing(rate)},
        {"/System/System ID", changing(system)},
        {"/System/Network ID", changing(network)},
        {"/System/Base Station ID", changing("[0-9]+")},
        {"/System/Packet Zone ID", changing("[0127]")},
        {"/System/Roaming Indicator", changing(roaming)},
        {"/System/Protocol Revision", changing("[06]")},
        {"/1x/Device State", changing(oneXState)},
        {"/1x/Band Class", changing(band)},
        {"/1x/Channel", changing("0|283|375")},
        {"/1x/Rx AGC", changing(fineLevel)},
        {"/1x/Tx AGC", inCalls(fineLevel)},
        {"/1x/Frame Error Rate", changing("[0-9]\\.[0-9][0-9]%|[0-9]\\.[0-9][0-9]% .old.")},
        {"/1x/Active Set", changing("(.ref pilot. )?-[0-9]+\\.[0-9][0-9] dB")},
        {"/1x/Second Receiver/Band Class", changing(std::string("N/A|") + band)},
        {"/1x/Second Receiver/Channel", changing("N/A|283|375")},
        {"/1x/Second Receiver/Rx AGC", inCalls(fineLevel)},
        {"/EV-DO/Device State", changing(evdoState)},
        {"/EV-DO/Session State", changing("[A-Z].* .[0-4].")},
        {"/EV-DO/Band Class", changing(band)},
        {"/EV-DO/Channel", changing("0|78|425")},
        {"/EV-DO/Serving PN Offset", changing("Invalid Value|[0-9]+ \u00D7 64chips")},
        {"/EV-DO/Rx AGC 0", changing(level)},
        {"/EV-DO/Rx AGC 1", inCalls(level)},
        {"/EV-DO/Tx AGC", inCalls(level)},
        {"/EV-DO/Active Set", changing("[+-][0-9]+\\.[0-9][0-9] dB")},
        {"/EV-DO/Fingers", changing("[+-][0-9]+\\.[0-9][0-9] dB|.none.")},
        {"/EV-DO/UATI 24", changing("0x[0-9a-f]+")},
        {"/EV-DO/Color Code", changing("0|4[127]")},
        {"/Data Rates/Forward Link", forwardRates},
        {"/Data Rates/Reverse Link", changing(rate)},
    };
    display.logLevel = LogPriority::Warning;
    display.reports = {
        {"Invalid log type: 2\\. Dropping\\.", Ge(5)},
        {"Log code .*", AllOf(Ge(30), Le(90))},
    };
    display.isReported = isUnusual;
    return display;
}

} // namespace velmora
