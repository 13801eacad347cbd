// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Fuzz/FuzzTargets.h"

#include <string_view>

/// The seed corpora of the targets. They are generated from the scenarios and the resources, so that none is
/// stored.

namespace velmora {

[[nodiscard]] FuzzCorpus propertyListCorpus();
/// The tokens of its XML form, and the signature of the binary one.
[[nodiscard]] std::vector<Data> propertyListTokens();
/// Of the technology of that scenario: scripts of its messages.
[[nodiscard]] FuzzCorpus decoderCorpus(std::string_view scenario);
[[nodiscard]] FuzzCorpus sameLabelsCorpus();
[[nodiscard]] FuzzCorpus templateCorpus();
[[nodiscard]] FuzzCorpus frameCorpus();
[[nodiscard]] FuzzCorpus recordingCorpus();
[[nodiscard]] FuzzCorpus dlfCorpus();
[[nodiscard]] FuzzCorpus snapshotCorpus();
[[nodiscard]] FuzzCorpus gzipCorpus();
[[nodiscard]] FuzzCorpus positionCorpus();
[[nodiscard]] FuzzCorpus sourceStringCorpus();
[[nodiscard]] FuzzCorpus ruleExpressionCorpus();
[[nodiscard]] FuzzCorpus ruleFileCorpus();

} // namespace velmora
