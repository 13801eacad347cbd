// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/RecordCommand.h"

#include "Tools/ExitStatus.h"
#include "Tools/Record/Recorder.h"
#include "Tools/Record/RecordingSession.h"
#include "Tools/Report.h"
#include "Tools/ServiceClient.h"

#include <memory>

namespace velmora {

namespace {

/// Reports what has been recorded, and what has not. Returns the exit status.
int sumUp(const RecordingSession& recording, const std::string& file, int status) {
    const pcapngBlocks::PacketCount unsaved = recording.unsaved();
    report("recorded " + std::to_string(recording.messages() - unsaved.messages) + " messages of " +
           recording.technology() + ", " + std::to_string(recording.bytes() - unsaved.bytes) + " bytes");
    const std::uint64_t missing = unsaved.messages + recording.dropped();
    // A pipe's reader that has closed it does not miss messages.
    if (missing == 0 || recording.hasClosedReader())
        return status;
    report(std::to_string(missing) + " messages are missing from " + file);
    return ExitStatus::BadInput;
}

} // namespace

int runRecord(const RecordOptions& options, DecoderLines& lines) {
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
    ServiceClient client;
    int status = Recorder(options, recording, lines, client).run();
    if (const Result<Done> closed = recording.close();
        !closed && status == ExitStatus::Done && !recording.hasClosedReader()) {
        report(closed.reason());
        status = ExitStatus::BadInput;
    }
    if (recording.technology().empty()) {
        if (status == ExitStatus::Done)
            report("nothing was recorded: the telephony service has named no technology");
        return ExitStatus::BadInput;
    }
    return sumUp(recording, options.file, status);
}

} // namespace velmora
