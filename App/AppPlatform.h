// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"
#include "Platform/FileSystem.h"
#include "Platform/Preferences.h"

namespace velmora {

/// The application's platform: the machine's, or a test's. Main thread only.
class AppPlatform {
public:
    virtual ~AppPlatform() = default;
    /// The model's platform; the screens use its queue and clock too.
    [[nodiscard]] virtual ModelPlatform model() = 0;
    [[nodiscard]] virtual FileSystem& files() = 0;
    [[nodiscard]] virtual Preferences& preferences() = 0;
};

} // namespace velmora
