// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/OutputFile.h"

#include <algorithm>
#include <cerrno>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <vector>

namespace velmora {

/// A disk as a test wants it. It outlives the file that the writer has of it.
struct FakeOutputFile {
    std::vector<std::uint8_t> content;
    std::size_t room = SIZE_MAX; ///< how much the file may hold; a write that finds some room takes it
    int fullError = ENOSPC;      ///< the error of a write that finds none
    std::size_t longestWrite = SIZE_MAX;
    int cutError = 0;
    bool isRegular = true;
    OutputFile::Change change; ///< by others

    std::size_t syncsStarted = 0;
    std::optional<int> syncOutcome; ///< of the sync under way; the test sets it
    int syncError = 0;              ///< of the awaited sync; returned once, as systems do
    std::size_t syncsWaitedFor = 0;
    bool closed = false;
    int closeError = 0;
};

class FakeRecordingFile final : public OutputFile {
public:
    explicit FakeRecordingFile(FakeOutputFile& medium) : _medium(medium) {}

    Written write(Bytes bytes) override {
        const std::size_t left = _medium.room - std::min(_medium.room, _medium.content.size());
        const std::size_t count = std::min({bytes.size(), left, _medium.longestWrite});
        if (count == 0)
            return {0, _medium.fullError};
        _medium.content.insert(_medium.content.end(), bytes.begin(),
                               bytes.begin() + static_cast<std::ptrdiff_t>(count));
        return {count, 0};
    }
    [[nodiscard]] bool isRegular() const override { return _medium.isRegular; }
    [[nodiscard]] Change change() const override { return _medium.change; }
    int truncateTo(std::uint64_t size) override {
        if (_medium.cutError != 0)
            return _medium.cutError;
        _medium.content.resize(static_cast<std::size_t>(size));
        return 0;
    }
    void startSync() override { ++_medium.syncsStarted; }
    std::optional<int> takeSyncResult() override {
        const std::optional<int> outcome = _medium.syncOutcome;
        _medium.syncOutcome.reset();
        return outcome;
    }
    int sync() override {
        ++_medium.syncsWaitedFor;
        const int error = _medium.syncError;
        _medium.syncError = 0;
        return error;
    }
    int close() override {
        _medium.closed = true;
        return _medium.closeError;
    }

private:
    FakeOutputFile& _medium;
};

} // namespace velmora
