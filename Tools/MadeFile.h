// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/AtomicFile.h"
#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Report.h"

#include <filesystem>
#include <functional>
#include <memory>
#include <string>

namespace velmora {

/// The file that a command makes.
struct MadeFile {
    std::string in;     ///< what it is made of: "-" is standard input; empty for several files
    std::string out;    ///< as the user names it
    bool force = false; ///< whether it may replace a file
};

/// Where the file is to be written; a failure where it must not be, as over the command's own input.
[[nodiscard]] Result<std::filesystem::path> targetOf(const MadeFile& file);

/// The command's input. A failure names the file.
[[nodiscard]] Result<std::unique_ptr<MessageReader>> inputOf(const MadeFile& file);

/// Makes the file at `target`, which appears when it is complete and never in part: neither after a failure
/// nor after an interruption by the user. `write` returns whether all of the input has been written. What
/// fails is reported, but for a failure without a reason, which has been. Returns whether all of the input is
/// in the file now.
[[nodiscard]] bool makeFile(const MadeFile& file, const std::filesystem::path& target,
                            const std::function<Result<bool>(AtomicFile&, WorkContext&)>& write);

} // namespace velmora
