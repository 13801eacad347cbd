// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Tracks/PositionedReader.h"
#include "LogGenerator/Extra/PayloadCache.h"
#include "LogGenerator/LogGenerator.h"
#include "PropertyLists/Value.h"
#include "Recording/Refreshes/RefreshTicks.h"
#include "Tools/Info/FileInfo.h"
#include "Tools/Messages/TechnologyChoice.h"

#include <cstddef>
#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// Reads a file for `info`, and counts its messages by technology. The technologies' decoders are made for
/// the names of the log codes, and for the messages that end the application; nothing else is decoded. A
/// technology without a decoder is counted as well.
class InfoCollector {
public:
    /// `technologies`: those of the whole file where they have been found out beforehand. Both must outlive
    /// it.
    InfoCollector(MessageReader& reader, const std::vector<std::string>& technologies)
        : _reader(reader), _beforehand(technologies) {
        _reader.setFixes([this](const Fix& fix) { add(fix); });
    }

    /// Reads to the end. `technology` overrides the file's, or chooses one; empty for the file's. Fails where
    /// a file of several technologies does not have the chosen one.
    [[nodiscard]] Result<Done> collect(const std::string& technology);

    /// The decoders, which its code names need, are this object's.
    [[nodiscard]] const FileInfo& info() const { return _info; }
    /// Why technologies have no decoder, one reason for each that lacks it.
    [[nodiscard]] const std::vector<std::string>& missingDecoders() const { return _missing; }

private:
    /// What is needed beside the technology's info, at the same index.
    struct Decoding {
        std::unique_ptr<LogGenerator> decoder; ///< null where there is none
        Dictionary state;
        PayloadCache payloads;
    };

    [[nodiscard]] Result<Done> choose(const std::string& technology);
    void start(const std::string& name);
    void startUpTo(std::size_t technology);
    void add(const LoggedMessage& message);
    void add(const Fix& fix);

    PositionedReader _reader;
    const std::vector<std::string>& _beforehand;
    TechnologyChoice _choice;
    MessageClock _clock;
    FileInfo _info;
    std::vector<std::unique_ptr<Decoding>> _decodings;
    std::vector<std::string> _missing;
};

} // namespace velmora
