// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

namespace velmora {

/// When the program was built, in the form "Sep 11 2019 18:54:57"; where the build was given
/// SOURCE_DATE_EPOCH, that moment, in UTC. In a source of its own, so that only that one differs from build
/// to build.
[[nodiscard]] const char* programBuildStamp();

} // namespace velmora
