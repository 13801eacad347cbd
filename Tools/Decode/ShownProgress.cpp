// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/ShownProgress.h"

#include <cstdint>
#include <string_view>
#include <utility>

#include <unistd.h>

namespace velmora {

ShownProgress::ShownProgress(const MessageReader& reader, const std::string& path, bool writesAsItGoes,
                             std::function<bool()> mayShow)
    : _mayShow(std::move(mayShow)) {
    if (!_mayShow && ::isatty(STDERR_FILENO) == 0)
        return;
    // Of a gzip'd file the offsets are no shares of its size.
    if (reader.isCompressed())
        return;
    // On the same terminal it would mix with the lines.
    if (writesAsItGoes && ::isatty(STDOUT_FILENO) != 0)
        return;
    const std::optional<std::uint64_t> size = inputSize(path);
    if (!size || *size <= DecodeProgress::smallestInput)
        return;
    _line.emplace();
    _progress.emplace(*size, _clock, [this](std::string_view text) {
        if (!_mayShow || _mayShow())
            _line->show(text);
    });
}

} // namespace velmora
