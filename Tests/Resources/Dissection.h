// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <span>
#include <string>
#include <string_view>
#include <vector>

/// The Wireshark dissector at work, by way of tshark.

namespace velmora {

/// What tshark says of a capture file with the dissector, one line a packet, with these options more. Expects
/// tshark to succeed, and the dissector to make no mistake of its own.
[[nodiscard]] std::vector<std::string> dissected(const std::string& path, const std::string& options);

/// The fields of each packet, separated by tabs; values of a field that a packet has several times by ";".
[[nodiscard]] std::vector<std::string> dissectedFields(const std::string& path,
                                                       const std::vector<std::string_view>& fields);

/// Writes a capture file of such messages, a second apart from 2026 on; `technology` as the interface's name.
void writeCapture(const std::string& path, std::string_view technology, std::span<const Data> messages);

} // namespace velmora
