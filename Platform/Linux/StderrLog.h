// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <string>

namespace velmora {

/// Writes lines to standard error in the form that service managers read: "<P>text", P the priority (0 to 7).
/// A trailing line feed ends the line; others are written as blanks. Each line is one write(2), so that lines
/// of several processes are not interleaved.
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
