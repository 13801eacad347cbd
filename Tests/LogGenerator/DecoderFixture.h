// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Tests/LogGenerator/SectionHarness.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A technology's decoder with the template that is shipped. The display is built already, so that log lines
/// are the sections' alone.
class DecoderFixture : public testing::Test {
protected:
    /// The template's name is that of the resource: "LTE".
    DecoderFixture(std::string_view templateName, std::string_view technology);

    /// Decodes the record; gives the log lines.
    LogLines update(const Data& record);
    [[nodiscard]] std::string display() { return shown(generator->display(state)); }
    /// A section's node as `shown` gives it.
    [[nodiscard]] std::string node(std::string_view group, std::string_view section);

    /// Expects a start command that asks for these codes, ascending, of the baseband's stream and for the
    /// three of the extra one.
    void expectStartCommand(const std::vector<std::int64_t>& codes) const;

    /// Makes another decoder and lets it go: expects this line first and, at its end, that each of these
    /// names says it is destructed.
    template <class Decoder>
    void expectFirstAndLastLines(const std::string& first, std::initializer_list<const char*> last) {
        CapturedLog log;
        std::unique_ptr<Decoder> another = Decoder::generator(clock);
        ASSERT_FALSE(log.lines().empty());
        EXPECT_EQ(log.lines().front(), (CapturedLog::Line{LogPriority::Error, first}));
        const LogLines expected = destructionLines(last, another.get());
        log.clear();
        another.reset();
        EXPECT_EQ(log.lines(), expected);
    }

    /// "NAME is destructed ADDRESS" for each name.
    [[nodiscard]] static LogLines destructionLines(std::initializer_list<const char*> names,
                                                   const void* decoder);

    FakeClock clock;
    FakeResources resources;
    std::unique_ptr<LogGenerator> generator;
    Dictionary state;
};

/// The lines of the sections that announce themselves by these words.
[[nodiscard]] LogLines traces(std::initializer_list<const char*> words);

} // namespace velmora
