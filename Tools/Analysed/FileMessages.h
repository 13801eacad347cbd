// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Analysed/AnalysisFeed.h"
#include "Tools/Decode/DecodeProgress.h"
#include "Tools/Decode/UndecodedMessages.h"
#include "Tools/Messages/TechnologyChoice.h"
#include "Tools/Report.h"

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace velmora {

/// Passes the messages of one file to the feeds of their technologies.
class FileMessages {
public:
    /// Which file it is, and the technology that the user chose, or none.
    struct File {
        std::uint32_t input = 0;
        std::string path;
        std::string technology;
    };

    /// `reader`, `feed` and `context` must outlive it.
    FileMessages(MessageReader& reader, File file, AnalysisFeed& feed, WorkContext& context)
        : _reader(reader), _file(std::move(file)), _feed(feed), _context(context) {}

    /// May be null.
    void setProgress(DecodeProgress* progress) { _progress = progress; }
    /// To the end of the file, or until `isDone`. Fails where the technology is unknown.
    Result<Done> run(const std::function<bool()>& isDone);

    [[nodiscard]] const UndecodedMessages& undecoded() const { return _undecoded; }

private:
    struct Technology {
        TechnologyFeed* feed = nullptr;
        std::string reason; ///< why there is no feed; empty where it has not been asked for
    };

    Result<Done> begin();
    void take(const LoggedMessage& message);
    [[nodiscard]] Technology& at(std::uint32_t index);
    void reportNewLosses(std::uint64_t number);
    void reportNewNotes(TechnologyFeed& feed);

    MessageReader& _reader;
    File _file;
    AnalysisFeed& _feed;
    WorkContext& _context;
    DecodeProgress* _progress = nullptr;
    TechnologyChoice _choice;
    std::vector<std::string> _known; ///< the file's technologies, where they are known beforehand
    std::vector<Technology> _technologies;
    std::uint64_t _losses = 0; ///< that have been reported
    UndecodedMessages _undecoded;
};

} // namespace velmora
