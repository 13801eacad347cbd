// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <chrono>

namespace velmora {

/// Starts the telephony service if none answers in the user's port directory: the unit
/// "velmora-telephonyd.service" where the user's service manager has it, else the program
/// "velmora-telephonyd" as a process of its own, which outlives this one. Blocks for up to `patience` for
/// each of the two ways. What was started is a log line; the failure is that of the last way. Main thread
/// only, on its event loop.
Result<Done> startTelephonyService(std::chrono::milliseconds patience = std::chrono::seconds(5));

} // namespace velmora
