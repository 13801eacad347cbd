// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Engine/EventEngine.h"
#include "Analysis/Events/Event.h"
#include "Analysis/Rules/RuleSet.h"
#include "Tools/Browse/Passes/FilePass.h"
#include "Tools/Browse/Passes/LevelBuckets.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// An event as it is listed.
struct BrowsedEvent {
    Time time{};
    std::optional<Time> end;
    Severity severity = Severity::Info;
    std::string kind;
    std::string text;           ///< printable
    std::uint64_t position = 0; ///< of the first message that made it
};

/// Finds a file's events, as `velmora-log events` does, and its levels. Begins once the index is complete.
class EventPass final : public FilePass, private EventSink {
public:
    /// Later ones are left out.
    static constexpr std::size_t most = 100'000;

    /// Both must outlive it.
    EventPass(const BrowsedFile& file, const RuleSet& rules);

    /// In the order of their times.
    [[nodiscard]] const std::vector<BrowsedEvent>& events() const { return _events; }
    [[nodiscard]] const LevelBuckets& levels() const { return _levels; }

private:
    void observed(const ObservedMessage& message) override;
    [[nodiscard]] bool wants(const CatalogueField& leaf) const override { return _engine.wants(leaf); }
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    void took(const LoggedMessage& /*message*/) override {}
    void ended() override { _engine.finish(); }
    void happened(const Event& event) override;

    EventEngine _engine;
    std::vector<BrowsedEvent> _events;
    LevelBuckets _levels;
};

} // namespace velmora
