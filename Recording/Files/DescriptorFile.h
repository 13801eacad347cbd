// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/OutputFile.h"

#include <future>

namespace velmora {

/// An open file descriptor that a recording is written to. A sync to storage may take seconds: `startSync`
/// waits for it on a separate thread, which does nothing else. Main thread only.
class DescriptorFile final : public OutputFile {
public:
    /// Writes at the descriptor's current position. Closes it on destruction when `owned`.
    DescriptorFile(int descriptor, bool owned);
    ~DescriptorFile() override;
    DescriptorFile(const DescriptorFile&) = delete;
    DescriptorFile& operator=(const DescriptorFile&) = delete;

    Written write(Bytes bytes) override;
    [[nodiscard]] bool isRegular() const override { return _regular; }
    int truncateTo(std::uint64_t size) override;
    void startSync() override;
    std::optional<int> takeSyncResult() override;
    int sync() override;
    int close() override;

private:
    int _descriptor; ///< -1 when closed
    bool _owned;
    bool _regular = false;
    std::uint64_t _start = 0; ///< offset of the recording in a regular file
    std::future<int> _syncing;
};

} // namespace velmora
