// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/Files/OutputFile.h"
#include "Recording/Pcapng/PcapngReader.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Writes a recording that is made of another one's blocks: those of the messages that are added, and between
/// them all that the reader passes on. Main thread only.
class RecordingCopy {
public:
    /// Failures name the file `name`. `technology`, a short name, becomes that of the interfaces of the
    /// reader's messages; empty: they keep theirs. Nothing has been read of `reader`, which must not be read
    /// any more after this has been destroyed.
    RecordingCopy(PcapngReader& reader, std::unique_ptr<OutputFile> file, std::string name,
                  std::string technology = {});

    /// Adds the message that the reader last returned.
    Result<Done> addMessage();
    /// Writes what is left.
    Result<Done> finish();

private:
    void addOther(const PcapngReader::Block& block);
    void add(Bytes bytes);
    void flush();
    [[nodiscard]] bool isRenamed(const PcapngReader::Block& block) const;

    PcapngReader& _reader;
    std::unique_ptr<OutputFile> _file;
    std::string _name;
    std::string _technology;
    std::vector<std::uint8_t> _buffer;
    std::optional<Failure> _failure;
};

} // namespace velmora
