// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

#include <array>
#include <cstddef>
#include <cstdint>

namespace velmora {

/// The purpose of a frame; exactly one of these bits is set in its flags.
enum class FrameKind : std::uint32_t {
    Request = 1, ///< a reply with the same serial is expected
    Reply = 2,   ///< carries the serial of its request
    OneWay = 4,  ///< no reply
};

/// A message on a port's socket: a header of 16 bytes and the payload. All numbers are little-endian.
///
///     offset 0   u32  payload length, at most `maximumFramePayload`
///            4   i32  message id
///            8   u32  flags: bit 0 request, bit 1 reply, bit 2 one-way - exactly one of them -, bit 3 with a
///                     reply that carries no data at all (which is not the same as data of no bytes); the
///                     length is then 0. The other bits are 0.
///           12   u32  serial: a request's number, repeated in its reply; 0 in a one-way message
struct Frame {
    FrameKind kind = FrameKind::OneWay;
    bool hasData = true; ///< false in a reply without data alone
    std::int32_t messageId = 0;
    std::uint32_t serial = 0;
    Data payload;
};

inline constexpr std::size_t frameHeaderSize = 16;
inline constexpr std::size_t maximumFramePayload = std::size_t{16} << 20;

/// What a header says, checked.
struct FrameHeader {
    FrameKind kind = FrameKind::OneWay;
    bool hasData = true;
    std::int32_t messageId = 0;
    std::uint32_t serial = 0;
    std::size_t payloadSize = 0;
};

using FrameHeaderBytes = std::array<std::uint8_t, frameHeaderSize>;

/// Precondition: the payload is not above the maximum.
[[nodiscard]] FrameHeaderBytes encodeFrameHeader(const Frame& frame);

/// Precondition: `bytes` holds at least a header. The failure names the found and the expected value.
Result<FrameHeader> decodeFrameHeader(Bytes bytes);

} // namespace velmora
