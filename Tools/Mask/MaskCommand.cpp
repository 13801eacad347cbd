// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/MaskCommand.h"

#include "Export/Masking/MessageMask.h"
#include "Platform/Linux/Files/AtomicFile.h"
#include "Recorder/OverwriteTarget.h"
#include "Recording/OpenMessages.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/ExitStatus.h"
#include "Tools/Mask/KeyFile.h"
#include "Tools/Mask/MaskCheck.h"
#include "Tools/Mask/MaskOption.h"
#include "Tools/Mask/Masking.h"
#include "Tools/Mask/ReportText.h"
#include "Tools/Output.h"
#include "Tools/OutputGuard.h"
#include "Tools/Report.h"

#include <filesystem>
#include <memory>
#include <optional>
#include <string>

#include <sys/stat.h>

namespace velmora {

namespace {

constexpr mode_t newFileMode = S_IRUSR | S_IWUSR;

Result<MaskOptions> maskOptions(const MaskCommandOptions& options) {
    const Result<MaskKey> key = keyFor(options.keyFile);
    if (!key)
        return Failure{key.reason()};
    const MaskOptions masking{*key, options.level, options.keepsUnknown};
    return options.keyFile.empty() ? masking : maskOptionsFor(options.file, masking);
}

/// Whether all of the input is in the output now.
bool maskInto(const MaskCommandOptions& options, const std::filesystem::path& target, MessageReader& reader,
              MessageMask& mask, const std::string& title) {
    // Before the output, so that an allocation that fails never leaves one on the disk.
    AtomicFile* made = nullptr;
    WorkContext context(title, [&made] {
        if (made)
            made->discard();
    });
    Result<AtomicFile> output = AtomicFile::create(target, newFileMode);
    if (!output) {
        report(options.out + ": " + output.reason());
        return false;
    }
    made = &*output;
    const RemovedWhenInterrupted removed(output->path());
    const Result<bool> masked = maskMessages(reader, options, mask, title, *output, context);
    if (!masked) {
        report(masked.reason());
        return false;
    }
    using IfExists = AtomicFile::IfExists;
    const auto committed = output->commit(options.force ? IfExists::Replace : IfExists::Refuse);
    if (!committed)
        report(options.out + ": " + committed.reason());
    return committed && *masked;
}

int maskFile(const MaskCommandOptions& options, Output& output) {
    if (const std::string reason = whyNotWritten(options.file, options.out, options.force); !reason.empty()) {
        report(reason);
        return ExitStatus::BadInput;
    }
    const Result<std::filesystem::path> target = overwriteTarget(options.out);
    const Result<MaskOptions> masking = target ? maskOptions(options) : Failure{target.reason()};
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    const std::string title = fileTitle(options.file);
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(options.file);
    if (!reader) {
        report(title + ": " + reader.reason());
        return ExitStatus::BadInput;
    }
    MessageMask mask(*masking);
    const bool isDone = maskInto(options, *target, **reader, mask, title);
    const bool isWhole = reportLosses(**reader, title);
    if (options.reports)
        output.put(reportText(title, mask.report()));
    output.flush();
    return isDone && isWhole && output.state() != Output::State::Failed ? ExitStatus::Done
                                                                        : ExitStatus::BadInput;
}

} // namespace

int runMask(const MaskCommandOptions& options, Output& output) {
    if (options.checks)
        return runMaskCheck(options, output);
    if (options.newKey.empty())
        return maskFile(options, output);
    if (const auto made = makeKeyFile(options.newKey); !made) {
        report(made.reason());
        return ExitStatus::BadInput;
    }
    return ExitStatus::Done;
}

} // namespace velmora
