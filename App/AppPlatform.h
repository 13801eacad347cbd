// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Model/VelmoraModel.h"
#include "Platform/FileSystem.h"
#include "Platform/Preferences.h"

#include <vector>

namespace velmora {

/// The application's platform: the machine's, or a test's. Main thread only.
class AppPlatform {
public:
    virtual ~AppPlatform() = default;
    /// The model's platform; the screens use its queue and clock too.
    [[nodiscard]] virtual ModelPlatform model() = 0;
    [[nodiscard]] virtual FileSystem& files() = 0;
    [[nodiscard]] virtual Preferences& preferences() = 0;
    /// The files of the rules for events and level classes, those that come along and the user's. None by
    /// default.
    [[nodiscard]] virtual std::vector<RuleFile> ruleFiles() { return {}; }
};

} // namespace velmora
