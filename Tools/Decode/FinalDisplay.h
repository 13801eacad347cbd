// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/DecodeWriter.h"

#include <string>
#include <utility>

namespace velmora {

/// The display after the last message: a JSON object, or the display tree. The tree has a heading where the
/// title is not empty, and where the file holds several technologies.
class FinalDisplay final : public DecodeWriter {
public:
    /// `isFirst`: nothing precedes the first heading.
    FinalDisplay(Output& output, const DecodeOptions& options, std::string title, bool isFirst)
        : DecodeWriter(output), _options(options), _title(std::move(title)), _isFirst(isFirst) {}
    void didMakeDecoder(LogGenerator& decoder) override { _options.selection.limit(decoder); }
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    void finish(const Decoded& decoded) override;

    /// Each ends in a line feed unless it is empty.
    [[nodiscard]] static std::string json(const Decoded& decoded, const NodeSelection& selection = {});
    [[nodiscard]] static std::string text(const Decoded& decoded, const NodeSelection& selection = {});

private:
    [[nodiscard]] std::string heading(const Decoded& decoded);

    const DecodeOptions& _options;
    std::string _title;
    bool _isFirst;
};

} // namespace velmora
