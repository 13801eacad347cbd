// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Fuzz/FuzzTarget.h"

#include <memory>
#include <span>
#include <string_view>
#include <vector>

namespace velmora {

/// A seed corpus with a dictionary of tokens.
struct FuzzCorpus {
    std::vector<Data> seeds;  ///< small valid inputs
    std::vector<Data> tokens; ///< tokens for mutation; at most 64 bytes each
};

/// An entry of the registry's list.
struct FuzzTargetKind {
    std::string_view name;
    std::unique_ptr<FuzzTarget> (*make)();
    FuzzCorpus (*corpus)(); ///< the same whenever it is called
    /// The maximum input length: enough for everything that a target does.
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
[[nodiscard]] std::unique_ptr<FuzzTarget> makeModemTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeIFXTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeSameLabelsTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeObservationsTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeReportTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeTemplateTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeFrameTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeRecordingTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeDLFTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeSnapshotTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeGzipTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makePositionTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeMaskTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeSourceStringTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeRuleExpressionTarget();
[[nodiscard]] std::unique_ptr<FuzzTarget> makeRuleFileTarget();

} // namespace velmora
