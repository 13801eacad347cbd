// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/Files/ChunkedInput.h"
#include "Recording/Files/FileSource.h"
#include "Recording/MessageReader.h"

#include <memory>
#include <string>
#include <vector>

namespace velmora {

/// Opens a file of log messages - a recording, a snapshot, a DLF log - recognising its form by its first
/// bytes, never by its name. A gzip'd one is unpacked as it is read. "-" is standard input. The reason does
/// not repeat the path.
/// The hooks are called in calls of the reader.
Result<std::unique_ptr<MessageReader>> openMessages(const std::string& path, FileSource::Hooks hooks);
inline Result<std::unique_ptr<MessageReader>> openMessages(const std::string& path) {
    return openMessages(path, FileSource::Hooks());
}
/// As above, for an input of which nothing has been skipped.
Result<std::unique_ptr<MessageReader>> openMessages(ChunkedInput input);

/// The technologies that a file names or is recognised by, all of which is read for that; none for a file
/// that is not a regular one, and for one that cannot be read.
[[nodiscard]] std::vector<std::string> technologiesOf(const std::string& path);

} // namespace velmora
