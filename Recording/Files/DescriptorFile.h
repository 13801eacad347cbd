// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/OutputFile.h"

#include <future>
#include <optional>
#include <string>

namespace velmora {

/// What others have done to the open file of that name, of which `length` bytes from `start` on were written.
[[nodiscard]] OutputFile::Change changeOf(int descriptor, const std::string& path, std::uint64_t start,
                                          std::uint64_t length);

/// An open file descriptor that a recording is written to. A sync to storage may take seconds: `startSync`
/// waits for it on a separate thread, which does nothing else. Main thread only.
class DescriptorFile final : public OutputFile {
public:
    /// Writes at the descriptor's current position. Closes it on destruction when `owned`.
    DescriptorFile(int descriptor, bool owned);
    ~DescriptorFile() override;
    DescriptorFile(const DescriptorFile&) = delete;
    DescriptorFile& operator=(const DescriptorFile&) = delete;

    /// From now on `change` reports what others do to a regular file, whose name this is, and writes go to
    /// its end, wherever that is.
    void watchForChanges(std::string path);

    Written write(Bytes bytes) override;
    [[nodiscard]] bool isRegular() const override { return _regular; }
    [[nodiscard]] Change change() const override;
    int truncateTo(std::uint64_t size) override;
    void startSync() override;
    std::optional<int> takeSyncResult() override;
    int sync() override;
    int close() override;

private:
    void noteWritten(std::uint64_t count);

    int _descriptor; ///< -1 when closed
    bool _owned;
    bool _regular = false;
    std::uint64_t _start = 0;                ///< offset of the recording in a regular file
    std::uint64_t _length = 0;               ///< how much of it has been written
    std::string _path;                       ///< empty where changes do not matter
    std::optional<std::uint64_t> _misplaced; ///< the length at which a write found the file instead
    std::future<int> _syncing;
};

} // namespace velmora
