// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/PropertyList.h"
#include "PropertyLists/Value.h"
#include "Telephony/Sources/LogSource.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <initializer_list>
#include <memory>
#include <stdexcept>
#include <vector>

namespace velmora {

/// A sink that keeps what it is given.
class CollectingSink final : public LogSink {
public:
    std::vector<Data> messages;
    bool room = true;
    int ends = 0;                 ///< how often the source has said that it ended
    std::function<void()> onTake; ///< runs after each message

    void receive(const Data& message) override {
        messages.push_back(message);
        if (onTake)
            onTake();
    }
    [[nodiscard]] bool hasRoom() const override { return room; }
    void sourceEnded() override { ++ends; }
};

/// The dictionary as an XML property list.
[[nodiscard]] inline Data plist(std::initializer_list<Dictionary::Entry> entries) {
    const auto text = writeXMLPropertyList(Value(std::make_shared<Dictionary>(entries)));
    if (!text)
        throw std::invalid_argument(text.reason());
    return Data(std::vector<std::uint8_t>(text->begin(), text->end()));
}

} // namespace velmora
