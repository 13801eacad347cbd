// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Model/VelmoraModel.h"
#include "Platform/FileSystem.h"
#include "Platform/Preferences.h"

namespace velmora {

/// What the application stands on: the machine's, or a test's. Main thread only.
class AppPlatform {
public:
    virtual ~AppPlatform() = default;
    /// What the model asks of the machine; its queue and clock are the screens' too.
    [[nodiscard]] virtual ModelPlatform model() = 0;
    [[nodiscard]] virtual FileSystem& files() = 0;
    [[nodiscard]] virtual Preferences& preferences() = 0;
};

} // namespace velmora
