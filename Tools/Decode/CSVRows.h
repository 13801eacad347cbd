// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/FreshValues.h"
#include "Tools/Text/LineWriter.h"

#include <string>
#include <vector>

namespace velmora {

/// Comma-separated values (RFC 4180), a row for each refresh or message: its time, the file where `file` is
/// not empty, the technology where the options have a column for it, and a cell for each selected path.
class CSVRows final : public LineWriter {
public:
    CSVRows(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);
    [[nodiscard]] bool wantsEveryRefresh() const override {
        return _options.every == DecodeOptions::Every::Refresh;
    }
    void didMakeDecoder(LogGenerator& decoder) override { _ages.watch(decoder); }
    void willConcern(const Decoded& decoded) override;
    void didDecode(const LoggedMessage& message, LogGenerator& decoder, Dictionary& state) override;
    void didRefresh(Time tick, const Decoded& decoded) override;

    /// The first row: "time", "file" where there are several, "technology" where the options have a column
    /// for it, the paths as they were given.
    [[nodiscard]] static std::string header(const DecodeOptions& options);

private:
    void writeRow(Time moment, const Value& display);
    /// The cell of a path with "*": all its values, with "; " between them.
    void appendAll(const Value& display, const std::string& path);

    const DecodeOptions& _options;
    std::string _fileCell;
    std::string _technologyCell;
    AgeLimit _ages;
    std::vector<const Value*> _found;
    TextBuffer _cell;
};

} // namespace velmora
