// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "LogGenerator/LogGenerator.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <cstdint>
#include <map>
#include <optional>
#include <set>
#include <span>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Where the records and entries lie that the fields of a message are read from: the decode functions of the
/// message's sections name their fields to it, as to any visitor, with the bytes that they read.
class FieldPlaces final : private FieldVisitor {
public:
    /// Of a message that the decoder has just decoded. `sections`: those that have accepted it.
    FieldPlaces(const LogGenerator& decoder, const Data& message, const std::set<std::string>& sections);

    /// How far into the message the place of the field counts from, in these rows; absent where no table has
    /// read it.
    [[nodiscard]] std::optional<std::size_t> find(const Field& field,
                                                  std::span<const std::uint32_t> rows) const;

private:
    struct Level {
        std::uint32_t next = 0;
        bool isOfValues = false;
    };

    void fields(const Record& record, const Layout& layout) override;
    void number(const Field& field, std::int64_t raw) override;
    void real(const Field& field, double value) override;
    void text(const Field& field, std::string_view text) override;
    void supplied(const Field& field, const Value& value) override;
    void removed(std::string_view) override {}
    void beginList(const List& list) override;
    void beginRow() override;
    void endRow() override {}
    void entryNumber(std::size_t index, std::uint16_t number) override;
    void endList() override;
    /// A value without a row of its own takes the next one of its list.
    void beginValue();

    Bytes _message;
    std::vector<Level> _levels;
    std::vector<std::uint32_t> _rows; ///< one for each level
    std::map<std::pair<const Field*, std::vector<std::uint32_t>>, std::size_t> _begins;
};

} // namespace velmora
