// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/FieldVisitor.h"
#include "PropertyLists/Value.h"

#include <string>
#include <string_view>

namespace velmora::C2K {

/// Gathers what the parsers name into one value a value key: a text, or for a numbered list a dictionary in
/// which each entry shows under its PN offset, in the order of the keys ("%d;%d": index in the record, PN
/// offset), as the marker "_sorted" requests.
class ValueVisitor : public FieldVisitor {
public:
    void fields(const Record& record, const Layout& layout) final;
    void number(const Field& field, std::int64_t raw) final;
    void real(const Field& field, double value) final;
    void text(const Field& field, std::string_view text) final;
    void supplied(const Field& field, const Value& value) final;
    void removed(std::string_view) final {}
    void beginList(const List& list) final;
    void beginRow() final {}
    void endRow() final {}
    void entryNumber(std::size_t index, std::uint16_t number) final;
    void endList() final;

protected:
    virtual void publishText(std::string_view valueKey, std::string_view text) = 0;
    virtual void publish(std::string_view valueKey, const Value& value) = 0;

private:
    void put(std::string_view valueKey, std::string_view text);

    const List* _list = nullptr; ///< that is being gathered
    DictionaryRef _entries;      ///< its entries
    std::string _entryKey;
};

} // namespace velmora::C2K
