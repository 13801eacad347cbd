// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstdint>
#include <limits>
#include <span>
#include <string_view>

namespace velmora {

/// Where a value lies in a message that is a property list: the key of its dictionary, and the numbers that
/// it may be, of which so many are one of the field's unit.
struct KeyedValue {
    std::string_view key;
    double least = std::numeric_limits<double>::lowest();
    double most = std::numeric_limits<double>::max();
    double divisor = 1;
    std::uint8_t lowBits = 0; ///< how many of a whole number's bits are read; 0 for all
    bool isSigned = false;    ///< these bits are in two's complement
};

/// What a section or parser describes to it: everything that it may show, without a record.
class ContentVisitor {
public:
    virtual ~ContentVisitor() = default;

    /// The places of what follows count from the record's sub-packet of that id; 0: from the record, as at
    /// first. The default takes no notice.
    virtual void subPacket(std::uint8_t /*id*/) {}
    virtual void fields(std::span<const Field> fields) = 0;
    virtual void beginList(const List& list) = 0;
    virtual void endList() = 0;

    /// A field whose value lies under a key. The default takes no notice of the key.
    virtual void keyed(const Field& each, const KeyedValue& /*value*/) { field(each); }

    void field(const Field& each) { fields({&each, 1}); }
    void contents(std::span<const Content> all) {
        for (const Content& each : all) {
            fields(each.fields);
            if (each.list)
                list(*each.list);
        }
    }
    /// A list by its contents.
    void list(const List& each) {
        beginList(each);
        contents(each.contents);
        endList();
    }
};

} // namespace velmora
