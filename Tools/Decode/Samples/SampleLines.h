// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Samples/SampleWriter.h"

#include <string>

namespace velmora {

/// One JSON object a line for each observed value.
class SampleLines final : public SampleWriter {
public:
    /// `file` goes in front where it is not empty.
    SampleLines(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);

private:
    void write(const ObservedMessage& message) override;
    [[nodiscard]] std::string textOf(const Decoded& decoded) const override;
    /// What the objects of the message have in common.
    void begin(const ObservedMessage& message);
    void appendValue(const Observation& observation);

    ObservedText _text;
    std::string _begin;
    TextBuffer _head; ///< of the message's objects, before the path
    TextBuffer _tail; ///< and after the text
};

} // namespace velmora
