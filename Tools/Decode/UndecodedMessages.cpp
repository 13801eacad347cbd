// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/UndecodedMessages.h"

#include "Tools/Report.h"

#include <utility>

namespace velmora {

void UndecodedMessages::add(const LoggedMessage& message, std::string reason) {
    ++_count;
    if (_first.size() < maximumKept)
        _first.push_back({message.number, message.offset, std::move(reason)});
}

bool UndecodedMessages::report(const std::string& title) const {
    for (const Message& message : _first)
        velmora::report(positionInFile(title, message.number, message.offset) + ": " + message.reason);
    if (_count != 0)
        velmora::report(title + ": " + std::to_string(_count) + (_count == 1 ? " message" : " messages") +
                        " could not be decoded");
    return _count == 0;
}

} // namespace velmora
