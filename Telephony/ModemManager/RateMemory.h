// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <filesystem>
#include <optional>
#include <string>

namespace velmora {

/// The polling rate of a modem that this service has changed.
struct RememberedRate {
    std::string owner; ///< the address on the bus of the ModemManager that it was set in
    std::string modem; ///< the modem's path
    std::uint32_t ours = 0;
    std::uint32_t earlier = 0; ///< to be put back

    friend bool operator==(const RememberedRate&, const RememberedRate&) = default;
};

/// Remembers the rate in a small file, so that a service that ended without putting it back can do so when it
/// starts again. The file lies in a directory that does not outlive the machine's uptime, as ModemManager's
/// rates do not.
class RateMemory {
public:
    static constexpr const char* fileName = "modemmanager-rate";

    /// An empty directory remembers nothing.
    explicit RateMemory(std::filesystem::path directory) : _directory(std::move(directory)) {}

    /// None where there is no file, or one that is malformed.
    [[nodiscard]] std::optional<RememberedRate> read() const;
    /// A failure is logged: the rate is put back at the end all the same, but not after a crash.
    void write(const RememberedRate& rate) const;
    void clear() const;

private:
    std::filesystem::path _directory;
};

} // namespace velmora
