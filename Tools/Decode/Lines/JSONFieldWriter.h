// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "Tools/Decode/Lines/JSONNode.h"

#include <array>
#include <cstddef>
#include <string>

namespace velmora {

/// Writes the fields of a record as JSON: into the JSON of a section's node what a DisplayWriter would write
/// into the node, or into that of a message's values what their keys and values are.
class JSONFieldWriter final : public FieldVisitor {
public:
    enum class Into : std::uint8_t {
        Section, ///< a section's node
        Values   ///< what is named is all that there is, in this order; numbered lists are dictionaries
    };

    /// What is named up to `end` is written into the node. It is begun again where naming was not completed.
    void begin(JSONNode& node, Into into);
    void end();

    void fields(const Record& record, const Layout& layout) override;
    void number(const Field& field, std::int64_t raw) override;
    void real(const Field& field, double value) override;
    void text(const Field& field, std::string_view text) override;
    void supplied(const Field& field, const Value& value) override;
    void removed(std::string_view label) override;
    void beginWhole() override;
    void endWhole() override;

    void beginList(const List& list) override;
    void beginRow() override;
    void endRow() override;
    void entryNumber(std::size_t index, std::uint16_t number) override;
    void endList() override;

private:
    /// A node that is being written; null where what is named is ignored.
    struct Level {
        JSONNode* node = nullptr;
        std::size_t next = 0;   ///< the index of the next member
        bool isInOrder = false; ///< members are written one after another, from `next` on
        bool isOpen = false;    ///< fields are written here
        const List* numbered = nullptr;
        std::size_t member = 0; ///< of a numbered list, in the level above
    };
    /// As deep as a DisplayWriter's.
    static constexpr std::size_t deepest = 5;

    [[nodiscard]] Level& level() { return _levels[_depth]; }
    void push(const Level& next);
    static constexpr std::size_t nowhere = ~std::size_t{0};

    /// The member for what this constant names; nowhere where it is ignored.
    [[nodiscard]] std::size_t memberFor(const void* source, std::string_view label);

    Into _into = Into::Section;
    std::array<Level, deepest> _levels;
    std::size_t _depth = 0;
    std::string _entryKey; ///< of the next entry of a numbered list
};

} // namespace velmora
