// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/OneX/SubPackets.h"

#include "Platform/SystemLog.h"

namespace velmora::C2K {

namespace {

constexpr std::size_t countAt = 14;
constexpr std::size_t firstAt = 17;
/// How far past the record's end a sub-packet may not end. The tolerance is intended.
constexpr std::size_t endTolerance = 17;

} // namespace

FoundSubPacket SubPackets::find(std::uint8_t id) const {
    using Outcome = FoundSubPacket::Outcome;
    const int count = _record.u8(countAt);
    std::size_t start = firstAt;
    for (int index = 0; index < count; ++index) {
        if (!_record.has(start, headerLength))
            return {Outcome::PastEnd, index, start};
        const std::uint16_t size = _record.u16(start + 2);
        const std::size_t end = start + size;
        if (end >= endTolerance + _record.size()) {
            logFormat(LogPriority::Error, "Log code error in subpkt#%d: bad size (%d).", index, int{size});
            return {};
        }
        if (_record.u8(start) == id)
            return {Outcome::Found, index, start};
        start = end;
    }
    return {};
}

bool SubPackets::contains(const FoundSubPacket& subPacket, std::size_t length, std::uint16_t logCode) const {
    if (_record.has(subPacket.offset, length))
        return true;
    logFormat(LogPriority::Error,
              "Log code 0x%04x is %u bytes long but its subpkt#%d needs at least %lu bytes.",
              unsigned{logCode}, static_cast<unsigned>(_record.size()), subPacket.index,
              static_cast<unsigned long>(subPacket.offset + length));
    return false;
}

} // namespace velmora::C2K
