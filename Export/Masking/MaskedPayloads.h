// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"
#include "Export/Masking/PropertyLists/PropertyKeys.h"
#include "Platform/Bytes.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <utility>
#include <vector>

namespace velmora {

/// Property lists that have been masked lately. What is always the same - SIM, modem, contexts - is sent
/// again and again, and to read and write a list takes far longer than to look it up. Most others come once,
/// as cells with their levels do: a list is kept when it comes for the second time. Memory is bounded.
class MaskedPayloads {
public:
    struct Entry {
        bool isChanged = false;
        std::vector<std::uint8_t> masked;                ///< where it is changed
        std::array<std::uint64_t, maskedCount> counts{}; ///< what masking it reports
    };

    /// Null where it is not among them. Valid until the next `add`.
    [[nodiscard]] const Entry* find(PropertyListKind kind, Bytes payload) const {
        const auto found = _lists[static_cast<std::size_t>(kind)].find(textOf(payload));
        return found == _lists[static_cast<std::size_t>(kind)].end() ? nullptr : &found->second;
    }
    void add(PropertyListKind kind, Bytes payload, Entry entry) {
        if (payload.size() > longest)
            return;
        const std::size_t hash = Hash{}(textOf(payload));
        if (std::exchange(_seen[hash % _seen.size()], hash) != hash)
            return;
        _size += payload.size() + entry.masked.size();
        if (_size > mostBytes) {
            for (auto& lists : _lists)
                lists.clear();
            _size = payload.size() + entry.masked.size();
        }
        _lists[static_cast<std::size_t>(kind)].insert_or_assign(std::string(textOf(payload)),
                                                                std::move(entry));
    }

private:
    static constexpr std::size_t kinds = 5;
    static constexpr std::size_t longest = std::size_t{16} << 10;
    static constexpr std::size_t mostBytes = std::size_t{1} << 20;

    struct Hash {
        using is_transparent = void;
        std::size_t operator()(std::string_view text) const { return std::hash<std::string_view>{}(text); }
    };

    static std::string_view textOf(Bytes payload) {
        return {reinterpret_cast<const char*>(payload.data()), payload.size()};
    }

    std::array<std::unordered_map<std::string, Entry, Hash, std::equal_to<>>, kinds> _lists;
    std::array<std::size_t, 1024> _seen{}; ///< hashes of lists that have come at least once
    std::size_t _size = 0;
};

} // namespace velmora
