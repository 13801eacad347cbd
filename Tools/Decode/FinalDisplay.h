// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/DecodeWriter.h"

#include <string>
#include <utility>

namespace velmora {

/// The display after the last message: a JSON object, or the display tree under a heading.
class FinalDisplay final : public DecodeWriter {
public:
    FinalDisplay(Output& output, const DecodeOptions& options, std::string heading)
        : DecodeWriter(output), _options(options), _heading(std::move(heading)) {}
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    void finish(const Decoded& decoded) override;

    /// Each ends in a line feed unless it is empty.
    [[nodiscard]] static std::string json(const Decoded& decoded, const NodeSelection& selection = {});
    [[nodiscard]] static std::string text(const Decoded& decoded, const NodeSelection& selection = {});

private:
    const DecodeOptions& _options;
    std::string _heading;
};

} // namespace velmora
