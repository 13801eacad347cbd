// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <gtest/gtest.h>

#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// A technology's decoder with the template that is shipped. The display is built already, so that log lines
/// are the sections' alone.
class DecoderFixture : public testing::Test {
protected:
    /// The template's name is that of the resource: "LTE".
    DecoderFixture(std::string_view templateName, std::string_view technology);

    /// Decodes the record; returns the log lines.
    LogLines update(const Data& record);
    [[nodiscard]] std::string display() { return shown(generator->display(state)); }
    /// A section's node as `shown` returns it; of a section that is in no group, the group is empty.
    [[nodiscard]] std::string node(std::string_view group, std::string_view section);

    FakeClock clock;
    FakeResources resources;
    std::unique_ptr<LogGenerator> generator;
    Dictionary state;
};

} // namespace velmora
