// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"

#include <sys/types.h>

namespace velmora {

/// Whether the process at the other end of a connected Unix-domain socket belongs to `wanted`; the failure
/// names the user that it belongs to.
Result<Done> checkPeerUser(int descriptor, uid_t wanted);

} // namespace velmora
