// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/ValueField.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora::C2K {

/// Where values are shown, by the lookup: value key to array of targets, a target being {"key": the label,
/// "dict": the display dictionary that holds it}. A target whose "dict" is no dictionary that can be changed,
/// or whose "key" is no string, ends the array. What has been found is kept until there is another lookup:
/// display and lookup are made together, and then stay as they are but for the values. Main thread only.
class Targets {
public:
    struct Target {
        Dictionary* display = nullptr;
        const std::string* label = nullptr; ///< its place in memory stands for it
    };
    /// The part of a parser's table that one display shows.
    struct Screen {
        Dictionary* display = nullptr;
        std::vector<std::uint8_t> labels; ///< see LabelledFields
    };
    /// Display by display; absent where the labels are too long for this.
    using Screens = std::optional<std::vector<Screen>>;

    /// The lookup to go by from now on; null where nothing is shown anywhere. It must be there whenever the
    /// following are called.
    void use(const DictionaryRef& lookup);

    /// Where the value of that key is shown, in the lookup's order. Valid until the next call.
    [[nodiscard]] std::span<const Target> of(std::string_view valueKey);
    /// The same for a whole table, which must be a constant.
    [[nodiscard]] const Screens& of(std::span<const ValueField> fields);

private:
    struct FoundKey {
        std::string_view constant; ///< as it was asked for; its place in memory tells where to look for it;
                                   ///< none where the place is empty
        std::string key;
        std::vector<Target> targets;
    };
    struct FoundFields {
        const ValueField* fields = nullptr;
        Screens screens;
    };

    [[nodiscard]] FoundKey& placeOf(std::string_view valueKey);
    [[nodiscard]] std::vector<Target> find(std::string_view valueKey) const;
    [[nodiscard]] Screens find(std::span<const ValueField> fields);

    std::weak_ptr<const Dictionary> _watch; ///< tells a lookup from a later one in the same place in memory
    const Dictionary* _lookup = nullptr;
    std::vector<FoundKey> _foundKeys;
    std::size_t _keptKeys = 0;
    std::vector<FoundFields> _foundFields;
};

/// The fields of a table that a display shows and under which labels, as bytes: for each of them its place in
/// the table, the label's length, and the label.
class LabelledFields {
public:
    explicit LabelledFields(Bytes bytes) : _rest(bytes) {}

    /// The most bytes that they take together.
    static constexpr std::size_t longest = 1024;

    /// Appends an entry; false where it, or all together, would be too long.
    [[nodiscard]] static bool append(std::vector<std::uint8_t>& bytes, std::size_t place,
                                     std::string_view label);

    struct Entry {
        std::size_t place = 0;
        std::string_view label;
    };
    /// Precondition: not `atEnd`.
    [[nodiscard]] Entry next();
    [[nodiscard]] bool atEnd() const { return _rest.empty(); }

private:
    Bytes _rest;
};

} // namespace velmora::C2K
