// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/ValueKeys.h"

#include <cstddef>

namespace velmora::C2K {

namespace {

class ValueKeys final : public ContentVisitor {
public:
    void fields(std::span<const Field> fields) override {
        for (const Field& field : fields)
            if (_depth == 0)
                all.push_back(field.label);
    }
    void beginList(const List& list) override {
        if (_depth++ == 0)
            all.push_back(list.label);
    }
    void endList() override { --_depth; }

    std::vector<std::string_view> all;

private:
    std::size_t _depth = 0; ///< in lists, each of which is one value
};

} // namespace

std::vector<std::string_view> valueKeysOf(const LogCodeParser& parser) {
    ValueKeys keys;
    parser.describe(keys);
    return keys.all;
}

} // namespace velmora::C2K
