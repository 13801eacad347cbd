// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/MaskCommand.h"

#include "Export/Masking/MessageMask.h"
#include "Tools/Decode/Decoding.h"
#include "Tools/ExitStatus.h"
#include "Tools/MadeFile.h"
#include "Tools/Mask/KeyFile.h"
#include "Tools/Mask/MaskCheck.h"
#include "Tools/Mask/MaskOption.h"
#include "Tools/Mask/Masking.h"
#include "Tools/Mask/ReportText.h"
#include "Tools/Output.h"
#include "Tools/Report.h"

#include <filesystem>
#include <memory>
#include <string>

namespace velmora {

namespace {

Result<MaskOptions> maskOptions(const MaskCommandOptions& options) {
    const Result<MaskKey> key = keyFor(options.keyFile);
    if (!key)
        return Failure{key.reason()};
    const MaskOptions masking{*key, options.level, options.keepsUnknown};
    return options.keyFile.empty() ? masking : maskOptionsFor(options.file, masking);
}

int maskFile(const MaskCommandOptions& options, Output& output) {
    const MadeFile file{options.file, options.out, options.force};
    const Result<std::filesystem::path> target = targetOf(file);
    const Result<MaskOptions> masking = target ? maskOptions(options) : Failure{target.reason()};
    if (!masking) {
        report(masking.reason());
        return ExitStatus::BadInput;
    }
    const Result<std::unique_ptr<MessageReader>> reader = inputOf(file);
    if (!reader) {
        report(reader.reason());
        return ExitStatus::BadInput;
    }
    const std::string title = fileTitle(options.file);
    MessageMask mask(*masking);
    const bool isDone = makeFile(file, *target, [&](AtomicFile& made, WorkContext& context) {
        return maskMessages(**reader, options, mask, title, made, context);
    });
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
