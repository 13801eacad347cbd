// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Resources/Dissection.h"
#include "Tests/Support/ShellCommand.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Tests that dissect captures with tshark; skipped without it.
class Dissector : public testing::Test {
protected:
    void SetUp() override { NEEDS_PROGRAM("tshark"); }

    /// A capture of such messages.
    [[nodiscard]] std::string capture(const std::vector<Data>& messages,
                                      std::string_view technology = "Ostrel_GSM") const {
        std::string path = _directory / "a.pcapng";
        writeCapture(path, technology, messages);
        return path;
    }

    TemporaryDirectory _directory;
};

} // namespace velmora
