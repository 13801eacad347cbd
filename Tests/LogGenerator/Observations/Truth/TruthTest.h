// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"

#include <gtest/gtest.h>

#include <chrono>
#include <cstdint>
#include <initializer_list>
#include <map>
#include <string>
#include <vector>

namespace velmora {

/// Plays a drive and compares what is observed, by role, with what the drive meant: the cells and the phone
/// that its messages were made from.
class TruthTest : public testing::Test, public ObservationSink {
protected:
    /// A value that has a role.
    struct Seen {
        Role role;
        std::string path;
        std::string row; ///< the path of the row that it is in; empty for none
        ObservedKind kind;
        double number;
        std::int64_t raw;
        std::string words;
    };
    using Row = std::map<Role, Seen>;

    explicit TruthTest(const DecodedTechnology& technology);
    ~TruthTest() override;

    /// Decodes that many messages of a drive and calls `compare(before, after)` after each, with the phone
    /// after the step before its own and after its own: a step's messages are made while it changes.
    template <class Kind, class Compare>
    void play(std::uint64_t seed, std::size_t messages, Compare compare) {
        Kind scenario(seed);
        auto before = scenario.phone();
        for (std::size_t i = 0; i < messages && !HasFailure(); ++i) {
            const auto phone = scenario.phone();
            const double step = scenario.now();
            const ScenarioEvent event = scenario.next();
            if (scenario.now() != step)
                before = phone;
            decode(event.message);
            // At the end of a step there may be an unusual message, which means nothing.
            if (std::chrono::duration<double>(event.offset).count() < scenario.now() - 1e-6)
                compare(scenario.network(), before, scenario.phone());
        }
    }
    void decode(const Data& message);

    [[nodiscard]] const std::vector<Seen>& seen() const { return _seen; }
    /// The rows that have a value of the role.
    [[nodiscard]] std::vector<Row> rowsWith(Role role) const;

    /// Each counts as a comparison of its role.
    void expectNumber(const Seen& value, double meant, double tolerance = 0);
    void expectRaw(const Seen& value, std::int64_t meant);
    void expectWords(const Seen& value, const std::string& meant);
    /// Expects that one of the meant numbers is observed within the tolerance.
    void expectAmong(const Seen& value, const std::vector<double>& meant, double tolerance = 0);
    /// Expects that each of the roles has been compared often.
    void expectCompared(std::initializer_list<Role> roles) const;

    /// A country or network code with so many digits.
    [[nodiscard]] static std::string digits(int number, std::size_t width);

private:
    void observed(const ObservedMessage& message) override;

    TechnologyUnderTest _tested;
    std::vector<Seen> _seen;
    std::map<Role, int> _compared;
};

} // namespace velmora
