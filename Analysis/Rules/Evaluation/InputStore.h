// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Rules/Evaluation/NeighbourColumns.h"
#include "Analysis/Rules/Expression/RuleInput.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Clock.h"

#include <cstddef>
#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A value that is reported for an input. Of kind `Absent`: there is none any more.
struct ReportedValue {
    ObservedKind kind = ObservedKind::Absent;
    double number = 0; ///< of a number; the raw one of an enumeration; 0 or 1 of a flag
    std::string_view text{};
};

/// The latest value of an input, of one row where it has several.
struct InputCell {
    ObservedKind kind = ObservedKind::Absent;
    double number = 0;
    std::string text;
    Time time{};             ///< when it was reported
    std::uint64_t turn = 0;  ///< of the store, in which it was reported
    MessageNumber message;   ///< that reported it
    bool hasChanged = false; ///< in that turn, from another value
    std::vector<std::uint32_t> rows;

    [[nodiscard]] bool isKnown() const { return kind != ObservedKind::Absent; }
};

/// The latest values of what rules read. Each message is a turn.
class InputStore {
public:
    struct Slot {
        RuleInput input;
        std::vector<InputCell> cells; ///< one, or one a row
        std::uint64_t turn = 0;       ///< in which it was reported or removed
        std::uint64_t changes = 0;    ///< how often that was
    };

    /// The slot of an input, which is made where there is none.
    std::uint32_t add(const RuleInput& input);
    [[nodiscard]] std::span<const Slot> slots() const { return _slots; }
    [[nodiscard]] const Slot& slot(std::uint32_t index) const { return _slots[index]; }

    void beginTurn(MessageNumber message, Time now);
    [[nodiscard]] Time now() const { return _now; }
    [[nodiscard]] std::uint64_t turn() const { return _turn; }
    [[nodiscard]] const MessageNumber& message() const { return _message; }
    /// The slots that were reported or removed in this turn, each once.
    [[nodiscard]] std::span<const std::uint32_t> touched() const { return _touched; }
    [[nodiscard]] bool isTouched(std::uint32_t slot) const { return _slots[slot].turn == _turn; }
    /// Whether the message of this turn reports a value of the slot, in any row or for any neighbour.
    [[nodiscard]] bool isReported(std::uint32_t slot) const;

    /// Sets the value of an input, of that row of a list. Rows beyond `mostRows` are dropped.
    void set(std::uint32_t slot, const ReportedValue& value, std::span<const std::uint32_t> rows = {});
    /// There is no value any more, in any row.
    void remove(std::uint32_t slot);

    void setNeighbours(std::span<const Neighbour> neighbours);
    [[nodiscard]] std::span<const Neighbour> neighbours() const { return _neighbours; }
    [[nodiscard]] const NeighbourColumns& neighbourColumns() const { return _neighbourColumns; }

    /// Nothing is known any more.
    void clear();

    static constexpr std::size_t mostRows = 256;

private:
    void touch(std::uint32_t slot);

    std::vector<Slot> _slots;
    std::vector<Neighbour> _neighbours;
    NeighbourColumns _neighbourColumns; ///< of the same
    std::vector<std::uint32_t> _touched;
    std::uint64_t _turn = 0;
    MessageNumber _message;
    Time _now{};
};

/// The value of a neighbour's role; for `None` whether it was detected.
[[nodiscard]] ReportedValue valueOf(const Neighbour& neighbour, Role role);

} // namespace velmora
