// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/MadeFile.h"

#include "Recorder/OverwriteTarget.h"
#include "Recording/OpenMessages.h"
#include "Tools/OutputGuard.h"

#include <sys/stat.h>

namespace velmora {

Result<std::filesystem::path> targetOf(const MadeFile& file) {
    if (std::string reason = whyNotWritten(file.in, file.out, file.force); !reason.empty())
        return Failure{std::move(reason)};
    return overwriteTarget(file.out);
}

Result<std::unique_ptr<MessageReader>> inputOf(const MadeFile& file) {
    Result<std::unique_ptr<MessageReader>> reader = openMessages(file.in);
    return reader ? std::move(reader) : Failure{fileTitle(file.in) + ": " + reader.reason()};
}

bool makeFile(const MadeFile& file, const std::filesystem::path& target,
              const std::function<Result<bool>(AtomicFile&, WorkContext&)>& write) {
    constexpr mode_t newFileMode = S_IRUSR | S_IWUSR;
    // Before the output, so that an allocation that fails never leaves one on the disk.
    AtomicFile* made = nullptr;
    WorkContext context(fileTitle(file.in), [&made] {
        if (made)
            made->discard();
    });
    Result<AtomicFile> output = AtomicFile::create(target, newFileMode);
    if (!output) {
        report(file.out + ": " + output.reason());
        return false;
    }
    made = &*output;
    const RemovedWhenInterrupted removed(output->path());
    const Result<bool> written = write(*output, context);
    if (!written) {
        if (!written.reason().empty())
            report(written.reason());
        return false;
    }
    using IfExists = AtomicFile::IfExists;
    const auto committed = output->commit(file.force ? IfExists::Replace : IfExists::Refuse);
    if (!committed)
        report(file.out + ": " + committed.reason());
    return committed && *written;
}

} // namespace velmora
