// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Telephony/Drives/RecordBuilder.h"

#include <functional>
#include <map>
#include <optional>

namespace velmora {

/// Changes the phone of a scenario and returns the record that reports it, or nothing where there is none to
/// send.
using DriveStep = std::function<std::optional<RecordBuilder>()>;

/// Steps by their time, in seconds from the scenario's start; those of the same time in the order of
/// insertion.
using DriveScript = std::multimap<double, DriveStep>;

} // namespace velmora
