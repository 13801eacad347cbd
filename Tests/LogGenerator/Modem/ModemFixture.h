// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogMessages/LiveModem.h"
#include "Tests/LogGenerator/DecoderFixture.h"

#include <cstdint>
#include <initializer_list>
#include <string>
#include <string_view>

namespace velmora {

/// A message of the technology Modem: the dictionary's entries under the code, in the property list's binary
/// form, which can hold any number.
[[nodiscard]] Data modemMessage(std::uint32_t code, std::initializer_list<Dictionary::Entry> entries);
[[nodiscard]] Data modemMessage(std::uint32_t code, const Value& payload);
/// The cells of a modem that is registered and reports neighbours.
[[nodiscard]] Data cellMessage(std::initializer_list<Value> cells);

[[nodiscard]] Value list(std::initializer_list<Value> values);
[[nodiscard]] Value dictionary(std::initializer_list<Dictionary::Entry> entries);

/// The decoder of the technology Modem with the template that is shipped.
class ModemFixture : public DecoderFixture {
protected:
    ModemFixture();

    /// A section's node as `shown` returns it, after the messages.
    std::string after(std::string_view section, std::initializer_list<Data> messages);
    [[nodiscard]] std::string sectionNode(std::string_view section);
    /// The text under a label of the section; "(none)" where there is none.
    [[nodiscard]] std::string text(std::string_view section, std::string_view label);
};

} // namespace velmora
