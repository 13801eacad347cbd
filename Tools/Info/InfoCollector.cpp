// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Info/InfoCollector.h"

#include "LogGenerator/Extra/ExtraPayload.h"
#include "LogGenerator/GSM/AssertionFailure.h"
#include "LogGenerator/GSM/GSMLogGenerator.h"
#include "LogGenerator/OstrelLogGenerator2.h"
#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"
#include "Tools/Technologies.h"

#include <optional>
#include <utility>

namespace velmora {

namespace {

/// Why the message ends the application; absent where it does not. `code`: its log code, if it has one.
std::optional<std::string> reasonNotDecoded(LogGenerator& decoder, Dictionary& state, PayloadCache& payloads,
                                            const Data& message, std::optional<std::uint32_t> code) {
    try {
        if (dynamic_cast<GSMLogGenerator*>(&decoder)) {
            decoder.updateState(state, message);
        } else if (code == ExtraCode::simFiles) {
            const auto* const withSections = dynamic_cast<OstrelLogGenerator2*>(&decoder);
            if (withSections && withSections->classIndex().getSubscribers(*code)) {
                const bool prefixed = LogMessage::parse(message.bytes())->prefixed;
                const LogCode_0xFF0000::SIMFileReader files(
                    prefixed ? message.from(LogMessage::prefixLength) : message, payloads);
            }
        }
    } catch (const LogCode_0xFF0000::UnknownDataException& failure) {
        return failure.what();
    } catch (const AssertionFailure& failure) {
        return failure.what();
    }
    return std::nullopt;
}

} // namespace

Result<Done> InfoCollector::collect(const std::string& technology) {
    _reader.setReadsAllTechnologies(true);
    // The first message before the technology: a file may name it no earlier than there.
    std::optional<LoggedMessage> message = _reader.next();
    if (const Result<Done> chosen = choose(technology); !chosen)
        return chosen;
    startUpTo(0);
    for (; message; message = _reader.next())
        add(*message);
    if (const std::size_t count = _reader.technologies().size();
        _choice.override.empty() && !_choice.only && count > 1)
        startUpTo(count - 1);
    return Done{};
}

Result<Done> InfoCollector::choose(const std::string& technology) {
    if (!technology.empty() && !isTechnology(technology)) {
        _choice.override = technology; // counted all the same
    } else {
        Result<TechnologyChoice> choice =
            TechnologyChoice::make(technology, knownTechnologies(_beforehand, _reader));
        if (!choice)
            return Failure{choice.reason()};
        _choice = *std::move(choice);
    }
    if (!_choice.override.empty())
        _reader.setReadsAllTechnologies(false);
    return Done{};
}

void InfoCollector::startUpTo(std::size_t technology) {
    const std::vector<std::string> names = knownTechnologies(_beforehand, _reader);
    while (_info.technologies.size() <= technology)
        start(_choice.nameOf(_choice.only.value_or(static_cast<std::uint32_t>(_info.technologies.size())),
                             names));
}

void InfoCollector::start(const std::string& name) {
    auto decoding = std::make_unique<Decoding>();
    Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(name, _clock);
    if (decoder)
        decoding->decoder = *std::move(decoder);
    else
        _missing.push_back(decoder.reason());
    const bool isBinary = technologyConstant(name) != kVoxLogChannelTechnology_IFX;
    _info.technologies.push_back({name, MessageSummary(isBinary), codeNames(decoding->decoder.get())});
    _decodings.push_back(std::move(decoding));
}

void InfoCollector::add(const Fix& fix) {
    PositionInfo& positions = _info.positions;
    ++positions.fixes;
    positions.first = std::min(positions.first.value_or(fix.time), fix.time);
    positions.last = std::max(positions.last.value_or(fix.time), fix.time);
}

void InfoCollector::add(const LoggedMessage& message) {
    if (_choice.only && message.technology != *_choice.only)
        return;
    const std::size_t index = _choice.only ? 0 : message.technology;
    startUpTo(index);
    MessageSummary& summary = _info.technologies[index].summary;
    const std::optional<std::uint32_t> code = summary.add(message);
    _info.positions.messages += _reader.position() ? 1 : 0;
    Decoding& decoding = *_decodings[index];
    if (!decoding.decoder)
        return;
    if (std::optional<std::string> reason =
            reasonNotDecoded(*decoding.decoder, decoding.state, decoding.payloads, message.message, code)) {
        summary.addUndecoded(message);
        _info.undecoded.add(message, *std::move(reason));
    }
}

} // namespace velmora
