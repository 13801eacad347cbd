// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <sys/types.h>

namespace velmora {

/// Whether the peer of a connected Unix-domain socket runs as the user `wanted`; the failure names the peer's
/// user.
Result<Done> checkPeerUser(int descriptor, uid_t wanted);

} // namespace velmora
