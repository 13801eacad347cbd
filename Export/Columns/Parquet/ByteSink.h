// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"

namespace velmora {

/// Where a writer's bytes go, front to back.
class ByteSink {
public:
    virtual ~ByteSink() = default;
    /// All of them, or a failure, after which nothing more is written.
    virtual Result<Done> write(Bytes bytes) = 0;
};

} // namespace velmora
