// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"

#include <cstdint>
#include <span>

namespace velmora {

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
