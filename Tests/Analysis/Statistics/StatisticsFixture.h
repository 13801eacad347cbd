// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Statistics/TechnologyStatistics.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// 2026-11-16 05:00:00 UTC and so many seconds.
[[nodiscard]] inline Time after(double seconds) {
    using namespace std::chrono;
    return sys_days{year{2026} / November / 16} + hours{5} +
           duration_cast<nanoseconds>(duration<double>(seconds));
}

/// A message that a test makes: values by path.
struct TestMessage {
    Time time;
    std::map<std::string, double> numbers{};
    std::map<std::string, std::string> texts{};
    std::vector<std::string> absent{};
    std::vector<std::string> removed{};
    std::uint32_t input = 0;
};

/// Statistics of one technology whose messages a test makes.
class TestStatistics {
public:
    explicit TestStatistics(StatisticsPlan plan = {}, const std::string& technology = "Test")
        : catalogue(technology),
          groups(std::move(plan), [this](const GroupStatistics& group) { complete(group); }),
          statistics(catalogue, groups) {}

    /// The leaf of the path, in the catalogue from then on.
    CatalogueField& leaf(const std::string& path) {
        CatalogueNode* node = &catalogue.root();
        for (std::size_t at = 1; at <= path.size();) {
            const std::size_t end = std::min(path.find('/', at), path.size());
            node = &node->child(path.substr(at, end - at));
            at = end + 1;
        }
        return catalogue.leafAt(*node, {});
    }

    void report(const TestMessage& message) {
        std::vector<Observation> observations;
        const auto add = [&](const std::string& path, ObservedKind kind) -> Observation& {
            Observation& observation = observations.emplace_back();
            observation.leaf = &leaf(path);
            observation.kind = kind;
            if (path.find("/*") != std::string::npos)
                observation.rows = firstRow;
            return observation;
        };
        for (const auto& [path, number] : message.numbers)
            add(path, ObservedKind::Number).number = number;
        for (const auto& [path, text] : message.texts) {
            Observation& observation = add(path, ObservedKind::Text);
            observation.words = text;
            observation.given = text;
        }
        for (const std::string& path : message.absent)
            add(path, ObservedKind::Absent);
        std::vector<const CatalogueField*> removed;
        for (const std::string& path : message.removed)
            removed.push_back(&leaf(path));
        const ObservedMessage observed{++_number, message.time, {}, {}, observations, {}, removed};
        statistics.report({{message.input, _number}, message.time, observed});
    }
    void finish() {
        statistics.finish();
        groups.finish();
    }

    Catalogue catalogue;
    StatisticsGroups groups;
    TechnologyStatistics statistics;
    /// Called for each group that is complete.
    std::function<void(const GroupStatistics& group)> complete = [](const GroupStatistics&) {};

private:
    static constexpr std::uint32_t firstRow[] = {0};
    std::uint64_t _number = 0;
};

/// The states of a leaf of the group's first part, as lines: "B: 2 samples, 10 s", "A > B: 1"; "(none)"
/// without.
[[nodiscard]] inline std::vector<std::string> stateLines(const GroupStatistics& group,
                                                         std::string_view path) {
    std::vector<std::string> lines;
    for (const auto& leaf : group.parts.front()->leaves) {
        if (!leaf || leaf->leaf.path != path)
            continue;
        const StateCounts& states = leaf->states;
        for (const StateCounts::Value& value : states.values()) {
            const auto milliseconds =
                std::chrono::duration_cast<std::chrono::milliseconds>(value.time).count();
            lines.push_back(value.text + ": " + std::to_string(value.samples) + " samples, " +
                            std::to_string(milliseconds) + " ms");
        }
        for (const auto& [change, count] : states.transitions())
            lines.push_back(states.at(change.first).text + " > " + states.at(change.second).text + ": " +
                            std::to_string(count));
        return lines;
    }
    return {"(none)"};
}

} // namespace velmora
