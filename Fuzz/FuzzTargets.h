// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Fuzz/FuzzTarget.h"

#include <memory>
#include <span>
#include <string_view>
#include <vector>

namespace velmora {

/// What a fuzzer starts from.
struct FuzzMaterial {
    std::vector<Data> seeds;  ///< good inputs, small ones
    std::vector<Data> tokens; ///< words that are worth putting into an input; at most 64 bytes each
};

/// A target that there is: one line in the registry's list.
struct FuzzTargetKind {
    std::string_view name;
    std::unique_ptr<FuzzTarget> (*make)();
    FuzzMaterial (*material)(); ///< the same whenever it is called
    /// How long inputs get: enough for all that a target does, since longer ones only cost time.
    std::size_t maximumLength = 1024;
};

/// All targets, in the order in which they are listed.
[[nodiscard]] std::span<const FuzzTargetKind> fuzzTargets();

// A fuzzer links one of these and nothing that only the others need; its line in CMakeLists.txt names it.

[[nodiscard]] std::unique_ptr<FuzzTarget> makePropertyListTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeOstrelGSMTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeLTETarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeUTRANTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeC2KTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeIFXTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeSameLabelsTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeTemplateTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeFrameTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeRecordingTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeDLFTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeSnapshotTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeSourceStringTarget();

} // namespace velmora
