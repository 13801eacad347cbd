// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <string>

namespace velmora {

/// Lines go to standard error as service managers read them: "<P>text", P the priority (0 to 7). A line feed
/// that ends the text ends the line; one inside it is shown as a blank, so that a line stays a line. Each
/// line is one write(2), so that lines of several processes do not run into each other.
class StderrLog final : public SystemLog {
public:
    StderrLog();
    /// To another descriptor, which stays the caller's.
    explicit StderrLog(int descriptor) : _descriptor(descriptor) {}

    void write(int priority, std::string_view text) override;

private:
    int _descriptor;
    std::string _line; ///< kept for its storage
};

} // namespace velmora
