// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Fuzz/FuzzTargets.h"

#include <string_view>

/// The seed corpora of the targets. They are generated from the scenarios and the resources, so that none is
/// stored.

namespace velmora {

[[nodiscard]] FuzzMaterial propertyListMaterial();
/// The words of its XML form, and the mark of the binary one.
[[nodiscard]] std::vector<Data> propertyListTokens();
/// Of the technology of that scenario: scripts of its messages.
[[nodiscard]] FuzzMaterial decoderMaterial(std::string_view scenario);
[[nodiscard]] FuzzMaterial sameLabelsMaterial();
[[nodiscard]] FuzzMaterial templateMaterial();
[[nodiscard]] FuzzMaterial frameMaterial();
[[nodiscard]] FuzzMaterial recordingMaterial();
[[nodiscard]] FuzzMaterial dlfMaterial();
[[nodiscard]] FuzzMaterial snapshotMaterial();
[[nodiscard]] FuzzMaterial sourceStringMaterial();

} // namespace velmora
