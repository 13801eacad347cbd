// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Statistics/ValueCounts.h"

#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <unordered_map>

namespace velmora {

/// The neighbour cells that a technology's messages reported.
class NeighbourRows {
public:
    static constexpr std::size_t most = 1024;
    static constexpr std::size_t mostValues = 512;

    /// What identifies a neighbour.
    struct Key {
        std::optional<RadioTechnology> technology;
        std::optional<double> channel;
        std::optional<double> physicalCell;
        friend auto operator<=>(const Key&, const Key&) = default;
    };
    struct KeyHash {
        [[nodiscard]] std::size_t operator()(const Key& key) const;
    };
    struct Row {
        std::uint64_t reports = 0;
        bool isDetected = false; ///< in some report: the network does not list it
        Time first{};
        Time last{};
        MessageNumber firstMessage;
        MessageNumber lastMessage;
        ValueCounts levels{mostValues};
        ValueCounts qualities{mostValues};
    };
    using Rows = std::map<Key, Row>;

    /// What the message reported, which the picture has.
    void report(const MessageReport& report, const RadioPicture& picture);

    [[nodiscard]] const Rows& rows() const { return _rows; }
    /// How many reports there were of further ones.
    [[nodiscard]] std::uint64_t omitted() const { return _omitted; }

private:
    /// Null where there are too many.
    [[nodiscard]] Row* rowOf(const Key& key, const MessageReport& report);

    Rows _rows;
    std::unordered_map<Key, Row*, KeyHash> _found; ///< the same rows: thousands of messages report each
    std::uint64_t _omitted = 0;
};

} // namespace velmora
