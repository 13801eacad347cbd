// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/RecordMask.h"

#include "Export/Masking/PropertyLists/SIMFileBytes.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogMessages/LogMessage.h"
#include "LogMessages/Record.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr std::uint32_t servingNetworkCode = 0x7135;
constexpr std::size_t servingNetworkOffset = 15;
constexpr std::uint32_t equivalentNetworksCode = 0x7150;
constexpr std::size_t equivalentNetworksOffset = 17;

/// Fields whose values other messages hold too, so that these get the same pseudonyms.
struct SharedField {
    std::uint32_t code;
    std::uint16_t offset;
    PseudonymKind kind;
    unsigned bits;
};
constexpr SharedField sharedFields[] = {
    {0x1183, 38, PseudonymKind::Temporary, 24},    {0x134F, 50, PseudonymKind::System, 15},
    {0x134F, 52, PseudonymKind::Network, 16},      {0x134F, 184, PseudonymKind::BaseStation, 16},
    {0x4127, 21, PseudonymKind::UMTSCell, 28},     {0x4127, 25, PseudonymKind::RegistrationArea, 16},
    {0x5134, 17, PseudonymKind::GSMCell, 16},      {0x7135, 18, PseudonymKind::LocationArea, 16},
    {0x7135, 20, PseudonymKind::RoutingArea, 8},   {0xB0C2, 22, PseudonymKind::LTESite, 28},
    {0xB0C2, 26, PseudonymKind::TrackingArea, 16}, {0xD0E2, 21, PseudonymKind::UMTSCell, 28},
};

Masked classOf(Identity identity) {
    switch (identity) {
    case Identity::Subscriber: return Masked::Subscriber;
    case Identity::Equipment: return Masked::Equipment;
    case Identity::Address: return Masked::Address;
    default: return Masked::Location;
    }
}

void setKnown(std::vector<std::uint8_t>& known, std::size_t first, std::size_t length) {
    if (first < known.size())
        std::fill_n(known.begin() + static_cast<std::ptrdiff_t>(first),
                    std::min(length, known.size() - first), std::uint8_t{0xFF});
}

/// The bits of a field from the lowest on, whatever order its bytes have.
template <class Visit>
void forEachByte(const Place& place, Visit visit) {
    for (std::size_t i = 0, count = place.end() - place.offset; i < count; ++i)
        visit(place.offset + (place.isBigEndian ? count - 1 - i : i), 8 * i);
}

std::uint64_t maskOf(const Place& place) {
    return ((std::uint64_t{1} << place.width) - 1) << place.bit;
}

std::uint64_t read(const Place& place, std::span<const std::uint8_t> record) {
    std::uint64_t value = 0;
    forEachByte(place, [&](std::size_t offset, std::size_t shift) {
        value |= std::uint64_t{record[offset]} << shift;
    });
    return (value & maskOf(place)) >> place.bit;
}

void write(const Place& place, std::span<std::uint8_t> record, std::uint64_t value) {
    forEachByte(place, [&](std::size_t offset, std::size_t shift) {
        const auto mask = static_cast<std::uint8_t>(maskOf(place) >> shift);
        const auto bits = static_cast<std::uint8_t>(value << place.bit >> shift);
        record[offset] = static_cast<std::uint8_t>((record[offset] & ~mask) | (bits & mask));
    });
}

std::size_t countAt(const Place& place, std::span<const std::uint8_t> record) {
    return !place.isComputed() && place.end() <= record.size() ? static_cast<std::size_t>(read(place, record))
                                                               : 0;
}

void addList(std::vector<std::uint8_t>& known, const KnownRegion& list,
             std::span<const std::uint8_t> record) {
    const std::size_t first = list.first + list.movedBy * countAt(list.moved, record);
    const std::size_t count = countAt(list.count, record) + list.countOffset;
    if (list.kind == KnownRegion::Kind::WholeList && first + count * list.stride > record.size())
        return;
    // Of an entry that the record ends within, nothing is read.
    for (std::size_t i = 0, at = first; i < count && at + list.stride <= record.size();
         ++i, at += list.stride)
        setKnown(known, at, list.length);
}

/// Sub-packets follow one another from 17 on, their count is at 14; each begins with its id and, two bytes
/// later, its size.
void addSubPackets(std::vector<std::uint8_t>& known, const KnownRegion& region,
                   std::span<const std::uint8_t> record) {
    constexpr std::size_t headerLength = 4;
    constexpr std::size_t firstSubPacket = 17;
    setKnown(known, region.first, 1);
    std::size_t at = firstSubPacket;
    for (std::size_t i = countAt(u8At(14), record); i > 0 && at + headerLength <= record.size(); --i) {
        const std::size_t size = numberAt<std::uint16_t>(&record[at + 2], std::endian::little);
        const bool isKnown = record[at] < 32 && (region.length >> record[at] & 1) != 0;
        // A known one may be shorter than what is read of it.
        constexpr std::size_t mostRead = 32;
        setKnown(known, at, isKnown ? std::max(size, mostRead) : headerLength);
        if (size == 0)
            break;
        at += size;
    }
}

} // namespace

RecordMask::RecordMask(const Catalogue& catalogue, const MaskOptions& options, Pseudonyms& pseudonyms,
                       MaskReport& report)
    : _options(options), _pseudonyms(pseudonyms), _report(report) {
    add(catalogue);
}

void RecordMask::add(const Catalogue& catalogue) {
    for (const CatalogueField& leaf : catalogue.fields())
        for (const CatalogueSource& source : leaf.sources) {
            const std::uint32_t code = source.code;
            if (code == 0 || code >= LogMessage::firstExtraCode)
                continue;
            RecordLayout& layout = _layouts[code];
            const Place& place = source.field->place;
            const Identity identity = source.field->means.identity;
            const bool isOfRecord = !place.isComputed() && !source.list && source.subPacket == 0;
            if (!isOfRecord) {
                if (identity != Identity::None && code != servingNetworkCode &&
                    code != equivalentNetworksCode)
                    _refused.insert(code);
                continue;
            }
            if (layout.known.size() < place.end())
                layout.known.resize(place.end());
            forEachByte(place, [&](std::size_t offset, std::size_t shift) {
                layout.known[offset] |= static_cast<std::uint8_t>(maskOf(place) >> shift);
            });
            const IdentityField field = fieldAt(code, place, identity);
            if (identity != Identity::None &&
                std::ranges::none_of(layout.identities, [&](const IdentityField& each) {
                    return each.place.offset == place.offset && each.place.bit == place.bit;
                }))
                layout.identities.push_back(field);
        }
}

RecordMask::IdentityField RecordMask::fieldAt(std::uint32_t code, const Place& place, Identity identity) {
    for (const SharedField& shared : sharedFields)
        if (shared.code == code && shared.offset == place.offset)
            return {place, classOf(identity), shared.kind, shared.bits};
    const auto own =
        static_cast<PseudonymKind>(static_cast<unsigned>(PseudonymKind::Other) + place.offset % 128);
    return {place, classOf(identity), own, place.width};
}

std::uint64_t RecordMask::pseudonym(const IdentityField& field, std::uint64_t value) {
    NumberPseudonyms& numbers = _pseudonyms.numbers;
    const unsigned width = field.place.width;
    switch (field.kind) {
    case PseudonymKind::GSMCell: return numbers.cell(CellIdentityForm::GSM, value, width);
    case PseudonymKind::UMTSCell: return numbers.cell(CellIdentityForm::UMTS, value, width);
    case PseudonymKind::LTESite: return numbers.cell(CellIdentityForm::LTE, value, width);
    case PseudonymKind::LocationArea:
    case PseudonymKind::TrackingArea:
    case PseudonymKind::RoutingArea: return numbers.area(field.kind, value, field.bits, width);
    default: return numbers.number(field.kind, value, field.bits, width);
    }
}

bool RecordMask::maskIdentities(const RecordLayout& layout, std::span<std::uint8_t> record) {
    bool changed = false;
    for (const IdentityField& field : layout.identities) {
        if (!isMasked(field.what) || field.place.offset >= record.size())
            continue;
        if (field.place.end() > record.size()) {
            // Part of one, which no decoder reads.
            const auto rest = record.subspan(field.place.offset);
            std::fill(rest.begin(), rest.end(), std::uint8_t{0});
            _report.add(field.what);
            changed = true;
            continue;
        }
        const std::uint64_t value = read(field.place, record);
        const std::uint64_t masked = pseudonym(field, value);
        if (masked == value)
            continue;
        write(field.place, record, masked);
        _report.add(field.what);
        changed = true;
    }
    return changed;
}

bool RecordMask::maskNetworks(std::uint32_t code, std::span<std::uint8_t> record) {
    constexpr std::size_t length = 3;
    if (code == servingNetworkCode && record.size() >= servingNetworkOffset + length) {
        maskNetwork(record.subspan(servingNetworkOffset, length), _pseudonyms.numbers);
        _report.add(Masked::Location);
        return true;
    }
    // The digits of neighbouring entries share bytes, so that no network can become another one.
    if (code == equivalentNetworksCode && record.size() > equivalentNetworksOffset) {
        const auto digits = record.subspan(equivalentNetworksOffset);
        if (std::ranges::all_of(digits, [](std::uint8_t digit) { return digit == 0; }))
            return false;
        std::ranges::fill(digits, std::uint8_t{0});
        _report.add(Masked::Location);
        return true;
    }
    return false;
}

bool RecordMask::clearUnknown(const RecordLayout& layout, std::span<std::uint8_t> record) {
    _known.assign(layout.known.begin(), layout.known.end());
    _known.resize(record.size());
    for (const KnownRegion& region : layout.regions) {
        switch (region.kind) {
        case KnownRegion::Kind::Fixed: setKnown(_known, region.first, region.length); break;
        case KnownRegion::Kind::List:
        case KnownRegion::Kind::WholeList: addList(_known, region, record); break;
        case KnownRegion::Kind::SubPackets: addSubPackets(_known, region, record); break;
        }
    }
    std::uint64_t cleared = 0;
    for (std::size_t i = LogMessage::headerLength; i < record.size(); ++i)
        if (const auto known = static_cast<std::uint8_t>(record[i] & _known[i]); known != record[i]) {
            record[i] = known;
            ++cleared;
        }
    _report.add(Masked::UnknownBytes, cleared);
    return cleared != 0;
}

bool RecordMask::mask(std::uint32_t code, std::span<std::uint8_t> record) {
    RecordLayout& layout = _layouts[code];
    layout.regions = knownRegionsOf(code);
    bool changed = !_options.keepsUnknown && clearUnknown(layout, record);
    changed = maskIdentities(layout, record) || changed;
    return (_options.masksAreas() && maskNetworks(code, record)) || changed;
}

} // namespace velmora
