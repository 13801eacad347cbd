// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/RecordingFile.h"

#include <future>

namespace velmora {

/// An open file descriptor that a recording is written to. The medium may take seconds to say that it has
/// everything: `startSync` waits for it on a thread of its own, which does nothing else. Main thread only.
class DescriptorFile final : public RecordingFile {
public:
    /// Writes from where the descriptor stands. Closes it in the end when `owned`.
    DescriptorFile(int descriptor, bool owned);
    ~DescriptorFile() override;
    DescriptorFile(const DescriptorFile&) = delete;
    DescriptorFile& operator=(const DescriptorFile&) = delete;

    Written write(Bytes bytes) override;
    [[nodiscard]] bool isRegular() const override { return _regular; }
    int cutTo(std::uint64_t size) override;
    void startSync() override;
    std::optional<int> takeSyncOutcome() override;
    int sync() override;
    int close() override;

private:
    int _descriptor; ///< -1 when closed
    bool _owned;
    bool _regular = false;
    std::uint64_t _start = 0; ///< where in a regular file the recording begins
    std::future<int> _syncing;
};

} // namespace velmora
