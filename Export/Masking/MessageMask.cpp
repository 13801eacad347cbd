// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MessageMask.h"

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogMessages/LiveModem.h"
#include "LogMessages/LogCodes.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/RecordTime.h"
#include "Platform/Clock.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"

#include <algorithm>
#include <chrono>
#include <limits>

namespace velmora {

namespace {

/// For a decoder that decodes nothing.
class NoClock final : public Clock {
public:
    [[nodiscard]] Time now() const override { return {}; }
    [[nodiscard]] ZoneState zoneAt(Time) const override { return {}; }
};

/// The set of that technology alone, see LogCodes.h.
std::uint8_t setOf(std::string_view shortName) {
    for (unsigned bit = 0; bit < technologyBits; ++bit)
        if (technologyOfBit(bit) == shortName)
            return static_cast<std::uint8_t>(1U << bit);
    return 0;
}

bool isBinary(Bytes list) {
    constexpr std::string_view mark = "bplist";
    return list.size() >= mark.size() && std::equal(mark.begin(), mark.end(), list.begin());
}

/// Whether length and time stamp are such that nothing else can be there. The stamp is 0 or within two days
/// of the arrival.
bool isHeader(const LogMessage& message, Time arrival) {
    constexpr std::uint64_t near = std::chrono::nanoseconds(std::chrono::hours(48)).count();
    if (message.record.size() - LogMessage::lengthOffset != message.length())
        return false;
    const std::uint64_t stamp = message.timestamp().value_or(0);
    const std::optional<Time> time = timeOfRecord(stamp);
    if (stamp == 0 || !time)
        return stamp == 0;
    // Unsigned, since times may be as far apart as there are any.
    const auto [early, late] = std::minmax(*time, arrival);
    return static_cast<std::uint64_t>(late.time_since_epoch().count()) -
               static_cast<std::uint64_t>(early.time_since_epoch().count()) <
           near;
}

constexpr std::string_view emptyArray = "<array/>";
constexpr std::string_view emptyDictionary = "<dict/>";

} // namespace

struct MessageMask::Technology {
    bool isDisplay = false; ///< its messages are property lists without a header
    bool isModem = false;
    bool isCDMA = false; ///< whose decoder does not look at a record's type
    std::uint8_t set = 0;
    std::unique_ptr<RecordMask> records;
};

MessageMask::MessageMask(const MaskOptions& options)
    : _options(options), _pseudonyms(_options), _propertyLists(_options, _pseudonyms, _report),
      _shift(_options.shift && _options.masksTimes() ? TimeShift(*_options.shift) : TimeShift()) {}

MessageMask::~MessageMask() = default;

MessageMask::Technology* MessageMask::technologyOf(std::string_view name) {
    if (const auto found = _technologies.find(name); found != _technologies.end())
        return found->second.get();
    std::unique_ptr<Technology> technology;
    if (isTechnology(name)) {
        const std::string constant = technologyConstant(name);
        technology = std::make_unique<Technology>();
        technology->isDisplay = constant == kVoxLogChannelTechnology_IFX;
        technology->isModem = constant == kVoxLogChannelTechnology_Modem;
        technology->isCDMA = constant == kVoxLogChannelTechnology_Ostrel_CDMA;
        technology->set = setOf(shortTechnologyName(constant));
        if (!technology->isDisplay) {
            const NoClock clock;
            const std::unique_ptr<LogGenerator> decoder =
                LogGenerator::generatorFromTechnology(constant, clock);
            if (decoder)
                technology->records =
                    std::make_unique<RecordMask>(decoder->catalogue(), _options, _pseudonyms, _report);
            else
                technology.reset();
        }
    }
    return _technologies.emplace(std::string(name), std::move(technology)).first->second.get();
}

std::optional<LoggedMessage> MessageMask::mask(LoggedMessage message, std::string_view name) {
    ++_report.messages;
    const Time arrival = message.time;
    if (_options.masksTimes()) {
        _shift.begin(message.time);
        message.time = _shift.shifted(message.time);
        if (message.refresh)
            message.refresh = _shift.shifted(*message.refresh);
    }
    Technology* const technology = technologyOf(name);
    if (!technology) {
        _report.add(Masked::OtherTechnology);
        ++_report.leftOut;
        return std::nullopt;
    }
    Buffer bytes(message.message.bytes().begin(), message.message.bytes().end());
    if (maskBytes(bytes, *technology, arrival)) {
        ++_report.changed;
        message.message = Data(std::move(bytes));
    }
    return message;
}

bool MessageMask::maskBytes(Buffer& bytes, Technology& technology, Time arrival) {
    return technology.isDisplay ? maskPayload(bytes, 0, PropertyListKind::Display)
                                : maskRecord(bytes, technology, arrival);
}

bool MessageMask::clear(Buffer& bytes, std::size_t from, Masked what) {
    const auto begin = bytes.begin() + static_cast<std::ptrdiff_t>(std::min(from, bytes.size()));
    if (_options.keepsUnknown || std::all_of(begin, bytes.end(), [](std::uint8_t byte) { return byte == 0; }))
        return false;
    std::fill(begin, bytes.end(), std::uint8_t{0});
    _report.add(what);
    return true;
}

bool MessageMask::maskRecord(Buffer& bytes, Technology& technology, Time arrival) {
    const std::optional<LogMessage> message = LogMessage::parse(bytes);
    if (!message || message->record.size() < LogMessage::headerLength)
        return clear(bytes, 0, Masked::Malformed);
    const std::size_t start = message->prefixed ? LogMessage::prefixLength : 0;
    const std::uint32_t code = message->logCode();
    const bool isExtra = message->type == LogMessage::extraType;
    if (!isExtra && message->type != LogMessage::basebandType && !technology.isCDMA) {
        // Where the rest of the header is one, files without framing need it to find the message's end.
        if (!isHeader(*message, arrival))
            return clear(bytes, start + 1, Masked::Malformed);
        const bool isShifted =
            _options.masksTimes() && shiftStamp(bytes, start + LogMessage::timestampOffset);
        return clear(bytes, start + LogMessage::headerLength, Masked::Malformed) || isShifted;
    }
    bool changed = _options.masksTimes() && shiftStamp(bytes, start + LogMessage::timestampOffset);
    const bool isWanted = (technologiesOfCode(code) & technology.set) != 0;
    if (isExtra && isWanted) {
        PropertyListKind kind = PropertyListKind::Modem;
        if (!technology.isModem)
            kind = code == ExtraCode::simFiles          ? PropertyListKind::SIMFiles
                   : code == ExtraCode::cellInformation ? PropertyListKind::Cells
                                                        : PropertyListKind::Contexts;
        return maskPayload(bytes, start + LogMessage::headerLength, kind) || changed;
    }
    if (!isExtra && isWanted && technology.records->knows(code))
        return technology.records->mask(code, std::span(bytes).subspan(start)) || changed;
    if (clear(bytes, start + LogMessage::headerLength, Masked::UnknownCode)) {
        changed = true;
        if (_report.unknownCodes.size() < MaskReport::mostCodes || _report.unknownCodes.contains(code))
            ++_report.unknownCodes[code];
    }
    return changed;
}

bool MessageMask::shiftStamp(Buffer& bytes, std::size_t offset) const {
    constexpr std::size_t length = 8;
    const auto stamp = numberAt<std::uint64_t>(&bytes[offset], std::endian::little);
    const std::uint64_t shifted = _shift.shiftedStamp(stamp);
    for (std::size_t i = 0; i < length; ++i)
        bytes[offset + i] = static_cast<std::uint8_t>(shifted >> (8 * i));
    return shifted != stamp;
}

MaskedPayloads::Entry MessageMask::maskedPayload(Bytes payload, PropertyListKind kind) {
    MaskedPayloads::Entry entry;
    const auto before = _report.counts;
    Result<Value> list = readPropertyList(payload, messageLimits);
    if (!list) {
        entry.masked.assign(payload.begin(), payload.end());
        entry.isChanged = clear(entry.masked, 0, Masked::Malformed);
    } else if (_propertyLists.mask(*list, kind, _shift.shift())) {
        entry.isChanged = true;
        if (!list->isNone() && isBinary(payload)) {
            if (auto written = writeBinaryPropertyList(*list))
                entry.masked = *std::move(written);
        } else if (!list->isNone()) {
            if (const auto written = writeXMLPropertyList(*list))
                entry.masked.assign(written->begin(), written->end());
        }
        // Nothing is worth a file that grows without limit; such a list shares values, or has no white space.
        if (entry.masked.empty() || entry.masked.size() > 2 * payload.size()) {
            const bool isArray = kind == PropertyListKind::Cells || kind == PropertyListKind::Contexts;
            const std::string_view empty = isArray ? emptyArray : emptyDictionary;
            entry.masked.assign(empty.begin(), empty.end());
        }
    }
    for (std::size_t i = 0; i < maskedCount; ++i)
        entry.counts[i] = _report.counts[i] - before[i];
    return entry;
}

bool MessageMask::maskPayload(Buffer& bytes, std::size_t offset, PropertyListKind kind) {
    const Bytes payload = Bytes(bytes).subspan(offset);
    const MaskedPayloads::Entry* known = _payloads.find(kind, payload);
    MaskedPayloads::Entry made;
    if (known) {
        for (std::size_t i = 0; i < maskedCount; ++i)
            _report.counts[i] += known->counts[i];
    } else {
        made = maskedPayload(payload, kind);
        known = &made;
    }
    if (!known->isChanged) {
        if (known == &made)
            _payloads.add(kind, payload, std::move(made));
        return false;
    }
    const Buffer original(payload.begin(), payload.end());
    replacePayload(bytes, offset, known->masked);
    if (known == &made)
        _payloads.add(kind, original, std::move(made));
    return true;
}

void MessageMask::replacePayload(Buffer& bytes, std::size_t offset, Bytes masked) {
    const std::size_t start = offset == 0 ? 0 : offset - LogMessage::headerLength;
    constexpr std::size_t longest = std::numeric_limits<std::uint16_t>::max();
    const auto lengthOf = [&] { return std::min(bytes.size() - start - LogMessage::lengthOffset, longest); };
    const bool hasLength = offset != 0 && numberAt<std::uint16_t>(&bytes[start + LogMessage::lengthOffset],
                                                                  std::endian::little) == lengthOf();
    bytes.resize(offset);
    bytes.insert(bytes.end(), masked.begin(), masked.end());
    if (hasLength) {
        const std::size_t length = lengthOf();
        bytes[start + LogMessage::lengthOffset] = static_cast<std::uint8_t>(length);
        bytes[start + LogMessage::lengthOffset + 1] = static_cast<std::uint8_t>(length >> 8);
    }
}

} // namespace velmora
