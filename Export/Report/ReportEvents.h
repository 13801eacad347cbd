// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Events/EventSink.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <map>
#include <optional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The events of a page, in bounded memory: texts are kept once, and events beyond a limit are counted alone.
class ReportEvents final : public EventSink {
public:
    /// Of each severity.
    static constexpr std::array<std::size_t, 3> most{24576, 8192, 8192};

    struct Item {
        Time time{};
        std::optional<Time> end;
        bool lasts = false;
        Severity severity = Severity::Info;
        std::uint32_t kind = 0; ///< in `names`
        std::uint32_t technology = 0;
        std::uint32_t text = 0;
        std::vector<MessageNumber> evidence;
    };

    /// Without identities, addresses and SIM cards are left out, and `ruleTexts` has for each rule that may
    /// name some the text to show instead.
    ReportEvents(bool hasIdentities, std::map<std::string, std::string, std::less<>> ruleTexts)
        : _hasIdentities(hasIdentities), _ruleTexts(std::move(ruleTexts)) {}

    void happened(const Event& event) override;
    /// The event's text, without identities where the page has none.
    [[nodiscard]] std::string shownText(const Event& event) const;
    /// Sorts them by their begin, those of the same time by kind. Call it before the following.
    void finish();

    [[nodiscard]] const std::vector<Item>& items() const { return _items; }
    [[nodiscard]] const std::string& name(std::uint32_t number) const { return _names[number]; }
    [[nodiscard]] const std::vector<std::string>& names() const { return _names; }
    /// How many of that severity there were, those that are not kept included.
    [[nodiscard]] std::uint64_t count(Severity severity) const {
        return _counts[static_cast<std::size_t>(severity)];
    }
    /// How many of each kind there were.
    [[nodiscard]] const std::map<std::string, std::uint64_t>& kinds() const { return _kinds; }
    [[nodiscard]] std::uint64_t omitted() const { return _omitted; }

private:
    [[nodiscard]] std::uint32_t numberOf(std::string_view name);

    bool _hasIdentities;
    std::map<std::string, std::string, std::less<>> _ruleTexts;
    std::vector<Item> _items;
    std::vector<std::string> _names;
    std::map<std::string, std::uint32_t, std::less<>> _numbers;
    std::array<std::uint64_t, 3> _counts{};
    std::map<std::string, std::uint64_t> _kinds;
    std::uint64_t _omitted = 0;
};

} // namespace velmora
