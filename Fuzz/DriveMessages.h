// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <chrono>
#include <cstddef>
#include <string_view>
#include <vector>

namespace velmora {

/// Messages of a scenario's drive: the first `each` of every log code and of every kind of unusual framing,
/// in the order in which they come, out of so much time. All of a technology whose messages are no records
/// count as of one code.
[[nodiscard]] std::vector<Data> driveMessages(std::string_view scenario, std::chrono::seconds duration,
                                              std::size_t each);

} // namespace velmora
