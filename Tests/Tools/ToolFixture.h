// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Clock.h"
#include "PropertyLists/Value.h"
#include "Tests/Support/Hex.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Tools/ToolProcess.h"

#include <gtest/gtest.h>

#include <chrono>
#include <cstdint>
#include <string>
#include <vector>

namespace velmora {

/// 2026-11-16 05:00:00 UTC and so many milliseconds.
[[nodiscard]] inline Time at(std::int64_t milliseconds) {
    using namespace std::chrono;
    return sys_days{year{2026} / November / 16} + hours{5} + std::chrono::milliseconds(milliseconds);
}

struct TimedMessage {
    Time time;
    Data message;
};

/// What RR State a GSM phone is in (0x512C): 4 is "RR_PLMN_LIST_CONSTRUCTION", 5 is "RR_IDLE".
[[nodiscard]] Data rrState(std::uint8_t state);
/// A message of the serialized-object stream: the value as an XML property list.
[[nodiscard]] Data serialized(const Value& value);

/// A directory of its own, with display templates of a few sections, recordings, and message ports.
class ToolTest : public testing::Test {
protected:
    ToolTest();

    [[nodiscard]] std::string path(const std::string& name) const { return (_directory / name).string(); }
    /// Writes a recording. Gives the offsets at which the messages' records begin, and then its length.
    std::vector<std::uint64_t> writeRecording(const std::string& name, const std::string& technology,
                                              const std::vector<TimedMessage>& messages) const;
    [[nodiscard]] std::string contentOf(const std::string& name) const;
    /// Runs velmora-log in the directory's environment.
    [[nodiscard]] ToolProcess::Setup tool(std::vector<std::string> arguments) const;
    /// The sockets and locks of ports that are left.
    [[nodiscard]] std::vector<std::string> portFiles() const;

    TemporaryDirectory _directory;
};

} // namespace velmora
