// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/Samples/SampleColumns.h"
#include "Tools/Decode/Samples/SampleWriter.h"

#include <cstddef>
#include <string>
#include <vector>

namespace velmora {

/// Comma-separated values, a row for each message that reported a selected value, a column for each selected
/// leaf. A list's rows have a row each, after the message's other values.
class WideRows final : public SampleWriter {
public:
    /// `columns` must outlive it. Where there are none yet, they are made for the decoder's technology, and
    /// the header is written.
    WideRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file,
             SampleColumns& columns);
    void didMakeDecoder(LogGenerator& decoder) override;
    [[nodiscard]] static std::string header(const DecodeOptions& options, const SampleColumns& columns);

private:
    static constexpr std::size_t noColumn = ~std::size_t{0};

    void write(const ObservedMessage& message) override;
    [[nodiscard]] std::string textOf(const Decoded& decoded) const override;
    void writeRow(const ObservedMessage& message, const Observation& first);
    /// The column of the observation; `noColumn` for none.
    [[nodiscard]] std::size_t columnOf(const Observation& observation, const SelectedLeaves::Choice& choice);

    SampleColumns& _columns;
    std::vector<const Observation*> _cells; ///< of the row that is being made
    std::string _fileCell;
};

} // namespace velmora
