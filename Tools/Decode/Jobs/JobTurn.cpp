// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/JobTurn.h"

#include "Tools/Decode/Jobs/Spool.h"
#include "Tools/Decode/Jobs/TurnMessage.h"
#include "Tools/ExitStatus.h"

#include <utility>

#include <unistd.h>

namespace velmora {

JobTurn::JobTurn(FileDescriptor channel, Spool& spool) : _channel(std::move(channel)), _spool(spool) {}

std::string_view JobTurn::take(std::string_view text) {
    if (!_channel)
        return text;
    if (!isFirst()) {
        text = _spool.append(text);
        if (text.empty())
            return text;
        _isFirst = receive(_channel) == TurnMessage::IsFirst;
    }
    // An answer that does not come means that the process that would print has ended.
    if (!_isFirst || !send(_channel, TurnMessage::IsHeld) || receive(_channel) != TurnMessage::MayWrite)
        ::_exit(ExitStatus::BadInput);
    _channel.reset();
    _spool.close();
    return text;
}

bool JobTurn::isFirst() {
    if (!_isFirst)
        _isFirst = receive(_channel, MSG_DONTWAIT) == TurnMessage::IsFirst;
    return _isFirst;
}

} // namespace velmora
