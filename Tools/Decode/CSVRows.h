// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/FreshValues.h"
#include "Tools/Decode/Rows/CellWriter.h"
#include "Tools/Decode/Rows/KeptRow.h"
#include "Tools/Text/LineWriter.h"

#include <map>
#include <string>
#include <string_view>

namespace velmora {

/// Comma-separated values (RFC 4180), a row for each refresh or message: its time, the file where `file` is
/// not empty, the technology where the options have a column for it, and a cell for each selected path.
class CSVRows final : public LineWriter {
public:
    CSVRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);
    [[nodiscard]] bool wantsEveryRefresh() const override {
        return _options.every == DecodeOptions::Every::Refresh;
    }
    void didMakeDecoder(LogGenerator& decoder) override;
    void willConcern(const Decoded& decoded) override;
    void didDecode(const LoggedMessage& message, LogGenerator& decoder, Dictionary& state) override;
    void didRefresh(Time tick, const Decoded& decoded) override;

    /// The first row: "time", "file" where there are several, "technology" where the options have a column
    /// for it, the paths as they were given.
    [[nodiscard]] static std::string header(const DecodeOptions& options);

private:
    void beginRow(Time moment);

    const DecodeOptions& _options;
    std::string _fileCell;
    std::string _technologyCell;
    AgeLimit _ages;
    CellWriter _cells;
    std::map<const LogGenerator*, KeptRow> _keptRows; ///< of rows by message
};

} // namespace velmora
