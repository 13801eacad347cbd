// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/DecodeProgress.h"

#include <algorithm>
#include <cmath>
#include <utility>

#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

constexpr std::uint64_t mebibyte = std::uint64_t{1} << 20;
constexpr auto showInterval = 200ms;

std::string duration(std::uint64_t seconds) {
    if (seconds < 60)
        return std::to_string(seconds) + " s";
    return std::to_string(seconds / 60) + " min " + std::to_string(seconds % 60) + " s";
}

} // namespace

DecodeProgress::DecodeProgress(std::uint64_t size, const Clock& clock, Print print)
    : _size(size), _clock(clock), _print(std::move(print)), _started(clock.now()), _shown(_started),
      _nextUpdate(mebibyte) {
    _print("0 %");
}

void DecodeProgress::update(std::uint64_t offset) {
    _nextUpdate = offset + mebibyte;
    const Time now = _clock.now();
    const double elapsed = std::chrono::duration<double>(now - _started).count();
    if (now - _shown < showInterval || elapsed <= 0)
        return;
    _shown = now;
    // A file may grow while it is read, even from an empty one; the rest cannot be estimated then.
    const std::uint64_t done = std::min(offset, _size);
    if (done == 0)
        return;
    const double bytesPerSecond = static_cast<double>(done) / elapsed;
    const double left = static_cast<double>(_size - done) / bytesPerSecond;
    _print(std::to_string(static_cast<int>(100.0 * static_cast<double>(done) / static_cast<double>(_size))) +
           " %, " + std::to_string(static_cast<std::uint64_t>(bytesPerSecond / mebibyte)) + " MiB/s, " +
           duration(static_cast<std::uint64_t>(std::llround(left))) + " left");
}

std::optional<std::uint64_t> inputSize(const std::string& path) {
    struct stat status = {};
    const int result = path == "-" ? ::fstat(STDIN_FILENO, &status) : ::stat(path.c_str(), &status);
    if (result != 0 || !S_ISREG(status.st_mode))
        return std::nullopt;
    return static_cast<std::uint64_t>(status.st_size);
}

} // namespace velmora
