// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Samples/SampleWriter.h"

#include <string>

namespace velmora {

/// Comma-separated values, a row for each observed value.
class SampleRows final : public SampleWriter {
public:
    /// `file` has a column where it is not empty.
    SampleRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);
    [[nodiscard]] static std::string header(const DecodeOptions& options);

private:
    void write(const ObservedMessage& message) override;
    [[nodiscard]] std::string textOf(const Decoded& decoded) const override;
    /// What the rows of the message have in common.
    void begin(const ObservedMessage& message);

    ObservedText _text;
    std::string _fileCell;
    TextBuffer _head; ///< of the message's rows, before the path
    TextBuffer _tail; ///< and after the text
};

} // namespace velmora
