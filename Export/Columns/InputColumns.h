// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Rules/RuleSet.h"
#include "Export/Columns/InputTable.h"
#include "Export/Columns/TableOutputs.h"
#include "Export/Columns/TechnologyTables.h"
#include "Platform/Result.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// What the table "files" says of an input, beside what its messages say.
struct InputFile {
    std::string hash; ///< by which all tables name it
    std::string name; ///< as the user gave it
    std::string form; ///< "recording"
    std::uint64_t size = 0;
    std::uint64_t losses = 0; ///< parts of it that could not be read
    std::uint64_t lostBytes = 0;
    bool isComplete = true; ///< it could be read to its end
};

/// All tables of an input: those of each of its technologies. Main thread only.
class InputColumns {
public:
    /// So much memory is used for rows that are not written yet, or a little more: what one message reports
    /// is kept in any case.
    static constexpr std::size_t mostMemory = std::size_t{16} << 20;
    /// The same of one table: of long texts, a copy that is being encoded takes as much again.
    static constexpr std::size_t mostOfTable = std::size_t{6} << 20;

    /// `rules`, whose events are in the tables, must outlive it.
    InputColumns(InputFile file, const RuleSet& rules, TableOutputs& outputs);

    /// The input's first technology, by its short name, if that is known before it is added: fixes that come
    /// earlier than that are kept otherwise.
    void beginPositions(const std::string& technology);
    /// Adds a technology, and returns the sink for its observations.
    TechnologyTables& add(const Catalogue& catalogue);
    /// The messages that follow are of the technology of that short name, which has been added.
    void select(std::string_view technology);
    /// A message is about to be decoded, and those before it have been.
    void willDecode(const CurrentMessage& message);

    /// The message that is being decoded has been, if there is one.
    void endMessage();
    /// Where the receiver was, as the input has it.
    void add(const Fix& fix);
    /// The input has a comment on that message, which is the latest one.
    void addNote(std::uint64_t message, std::string_view text);
    /// A part of the input before the next message could not be read. `message`: as a Loss has it; 0 for the
    /// end.
    void addLoss(std::uint64_t message, std::string_view reason);

    /// The input has ended. Of `file` counts what reading it has shown.
    Result<Done> finish(const InputFile& file);
    /// Why writing failed; absent while it has not.
    [[nodiscard]] const std::optional<Failure>& failure() const { return _failure; }

    /// Over all technologies.
    [[nodiscard]] std::size_t tables() const;
    [[nodiscard]] std::uint64_t rows() const;

private:
    /// Writes the largest tables until the rest is small enough.
    void limitMemory();
    [[nodiscard]] std::size_t limitOthers();
    void note(const Result<Done>& result);

    InputFile _file;
    const RuleSet& _rules;
    TableOutputs& _outputs;
    PageCompressor _compressor;
    CurrentMessage _message;
    std::vector<std::unique_ptr<TechnologyTables>> _technologies;
    TechnologyTables* _current = nullptr;
    std::vector<Fix> _early;              ///< before there was a technology
    std::optional<InputTable> _positions; ///< in the directory of the input's first technology
    std::optional<Failure> _failure;
    std::uint64_t _unchecked = 0; ///< messages since memory was measured
};

} // namespace velmora
