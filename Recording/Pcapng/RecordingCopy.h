// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Fix.h"
#include "Platform/Result.h"
#include "Recording/Files/OutputFile.h"
#include "Recording/Pcapng/PcapngReader.h"
#include "Recording/Positions/PositionSentence.h"
#include "Recording/Positions/SentencesOfRange.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Writes a recording that is made of another one's blocks: those of the messages that are added, and between
/// them all that the reader passes on. Main thread only.
class RecordingCopy {
public:
    /// The names of the interfaces of log messages in the copy; by default they keep theirs.
    struct Names {
        std::string technology =
            {}; ///< a short name: that of the interfaces of the reader's first technology
        /// A short name: interfaces of other technologies, whose messages are not added, lose their names, so
        /// that the copy has this technology alone.
        std::string only = {};
    };

    /// Failures name the file `name`. Nothing has been read of `reader`, which must not be read any more
    /// after this has been destroyed.
    RecordingCopy(PcapngReader& reader, std::unique_ptr<OutputFile> file, std::string name, Names names);

    /// Copies only positions of that range (see SentencesOfRange), the default being all. Before anything has
    /// been read.
    void setPositionRange(SentencesOfRange::SideOf sideOf);
    /// Adds the message that the reader last returned, with these comments beside its own. Fails where its
    /// packet is of a kind that has none.
    Result<Done> addMessage(std::span<const std::string> comments = {});
    /// Adds a fix, on an interface of positions that the copy gets. Fails where the recording has positions
    /// of its own, and where it is big-endian.
    Result<Done> addFix(const Fix& fix);
    /// Writes what is left, and the interface of the technology where the recording has none of messages.
    Result<Done> finish();

private:
    void addOther(const PcapngReader::Block& block);
    void addSentence(const PcapngReader::Block& block);
    void addInterface(const PcapngReader::Block& block);
    void addBlock(std::vector<std::uint8_t> block);
    void add(Bytes bytes);
    void flush();
    /// The name in the copy of an interface of messages; absent where it keeps its own.
    [[nodiscard]] std::optional<std::string> newName(std::string_view name) const;

    PcapngReader& _reader;
    std::unique_ptr<OutputFile> _file;
    std::string _name;
    Names _names;
    std::vector<std::uint8_t> _buffer;
    std::optional<SentencesOfRange> _range; ///< of the positions that are copied; absent for all
    /// Its block is the next one.
    std::optional<PositionSentence> _sentence;
    std::string _sentenceText;
    std::uint32_t _interfaces = 0;                   ///< of the present section, in the copy
    std::optional<std::uint32_t> _positionInterface; ///< of added fixes; in the present section
    bool _hasPositions = false;                      ///< of the recording itself
    bool _isBigEndian = false;                       ///< the present section
    bool _hasSection = false;                        ///< a section header has been added
    bool _hasInterface = false;                      ///< an interface of messages has been added
    std::optional<Failure> _failure;
};

} // namespace velmora
