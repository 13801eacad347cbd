// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "PropertyLists/Value.h"

#include <string_view>

namespace velmora {

/// The root of a snapshot file: a dictionary of "Timestamp" (a date description), "Data" (the save contents)
/// and "Description", in this order. Without save contents, which is null where there is no decoder, it ends
/// before them and holds the time stamp alone.
[[nodiscard]] DictionaryRef makeSnapshot(Time timeStamp, const ArrayRef& saveContents,
                                         std::string_view description);

} // namespace velmora
