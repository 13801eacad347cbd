// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/RecordCommand.h"

#include "Recorder/RecordingSession.h"
#include "Tools/ExitStatus.h"
#include "Tools/Record/Positions/RecordedPositions.h"
#include "Tools/Record/Recorder.h"
#include "Tools/Report.h"
#include "Tools/ServiceClient.h"

#include <memory>
#include <string>

namespace velmora {

namespace {

/// Reports what has been recorded, and what has not. Returns the exit status.
int sumUp(const RecordingSession& recording, bool hasPositions, int status) {
    const pcapngBlocks::PacketCount unsaved = recording.unsaved();
    std::string text = "recorded " + std::to_string(recording.messages() - unsaved.messages) +
                       " messages of " + recording.technology() + ", " +
                       std::to_string(recording.bytes() - unsaved.bytes) + " bytes";
    if (hasPositions)
        text += ", and " + std::to_string(recording.sentences()) + " sentences of positions";
    if (!recording.moves().empty()) {
        text +=
            ", the last " + std::to_string(recording.messagesSinceMove() - unsaved.messages) + " of them in ";
        for (const RecordingSession::Move& move : recording.moves())
            text += (&move == &recording.moves().front() ? "" : " and ") + move.file;
        status = ExitStatus::BadInput;
    }
    report(text);
    const std::uint64_t missing = unsaved.messages + recording.dropped();
    // A pipe's reader that has closed it does not miss messages.
    if (missing == 0 || recording.hasClosedReader())
        return status;
    report(std::to_string(missing) + " messages are missing from " + recording.file());
    return ExitStatus::BadInput;
}

} // namespace

int runRecord(const RecordOptions& options, DecoderLines& lines) {
    RecordedPositions positions(options.positions.empty() ? PositionChoice()
                                                          : positionChoice(options.positions));
    if (const Result<Done> loaded = positions.load(); !loaded) {
        report(loaded.reason());
        return ExitStatus::BadInput;
    }
    const RecordingSession* opened = nullptr;
    const WorkContext context(options.file, [&opened] {
        if (opened)
            opened->removeIfEmpty();
    });
    const Result<std::unique_ptr<RecordingSession>> session =
        RecordingSession::open(options.file, options.force);
    if (!session) {
        report(session.reason());
        return ExitStatus::BadInput;
    }
    RecordingSession& recording = **session;
    opened = &recording;
    if (positions.areWanted())
        recording.setHasPositions();
    ServiceClient client;
    int status = Recorder(options, recording, lines, client, positions).run();
    const std::size_t reportedMoves = recording.moves().size();
    const Result<Done> closed = recording.close();
    for (std::size_t move = reportedMoves; move < recording.moves().size(); ++move)
        report(recording.moves()[move].reason + "; the recording ends in " + recording.moves()[move].file);
    if (!closed && status == ExitStatus::Done && !recording.hasClosedReader()) {
        report(closed.reason());
        status = ExitStatus::BadInput;
    }
    if (recording.technology().empty()) {
        if (status == ExitStatus::Done)
            report("nothing was recorded: the telephony service has named no technology");
        return ExitStatus::BadInput;
    }
    return sumUp(recording, positions.areWanted(), status);
}

} // namespace velmora
