// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MessageMask.h"
#include "Playback/PlayedFile.h"
#include "Playback/RecordingIndex.h"
#include "Tools/Messages/CodeNames.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// A recording that is looked into: the messages of one technology in it, each by its position, counted from
/// 0. It is indexed in steps; what has been read so far can be looked at meanwhile. Main thread only.
class BrowsedFile {
public:
    /// `technology`: its short name; empty for the first of the file. `masking`: absent for messages as they
    /// are. The reason does not repeat the path.
    static Result<std::unique_ptr<BrowsedFile>> open(const std::string& path, const std::string& technology,
                                                     const std::optional<MaskOptions>& masking);

    /// Reads at most that many messages of the file on. False once all is read.
    bool readOn(std::uint64_t messages) { return _index->read(messages); }

    [[nodiscard]] const std::string& path() const { return _file->path(); }
    /// How the messages are masked, so that they are masked the same once more; absent where they are not.
    [[nodiscard]] std::optional<MaskOptions> masking() const;
    [[nodiscard]] const PlayedFile& file() const { return *_file; }
    [[nodiscard]] const RecordingIndex& index() const { return *_index; }
    /// How many messages have been read so far.
    [[nodiscard]] std::uint64_t messages() const { return _index->messages(); }
    [[nodiscard]] bool isComplete() const { return _index->isComplete(); }
    [[nodiscard]] const Catalogue& catalogue() const { return _index->decoder().decoder().catalogue(); }
    /// What the messages of a log code are called: "Serving Cell, Power Levels"; empty for nothing known.
    [[nodiscard]] std::string nameOf(std::uint32_t code) const;

private:
    BrowsedFile() = default;

    std::optional<MessageMask> _mask; ///< of all readers of the file
    std::unique_ptr<PlayedFile> _file;
    std::unique_ptr<RecordingIndex> _index;
    CodeNames _names;
};

} // namespace velmora
