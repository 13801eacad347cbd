// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/MessageEffects.h"

#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Records what a decoder has reported of messages: the latest message's code and the names and values, in
/// order.
class RecordedEffects final : public MessageEffects {
public:
    enum class Kind { None, Sections, Values, Display };

    Kind kind = Kind::None;
    int messages = 0; ///< number of reported messages
    std::optional<std::uint32_t> code;
    std::vector<std::pair<std::string, Value>> members;

    void sections(std::optional<std::uint32_t> messageCode) override { begin(Kind::Sections, messageCode); }
    void section(std::string_view name, const Value& node) override { members.emplace_back(name, node); }
    void values(std::optional<std::uint32_t> messageCode) override { begin(Kind::Values, messageCode); }
    void value(std::string_view key, const Value& value) override { members.emplace_back(key, value); }
    void display(const Value& display) override {
        begin(Kind::Display, std::nullopt);
        members.emplace_back("", display);
    }

private:
    void begin(Kind newKind, std::optional<std::uint32_t> messageCode) {
        kind = newKind;
        ++messages;
        code = messageCode;
        members.clear();
    }
};

} // namespace velmora
