// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Result.h"
#include "PropertyLists/Value.h"

#include <vector>

namespace velmora {

/// Which log messages a client has asked for. One made without codes passes everything.
class LogFilter {
public:
    LogFilter() = default;

    /// The filter that a start command requests: the codes of its two lists, or everything where it has
    /// neither list. A list that is missing beside the other is empty. Fails for a list that is no array of
    /// numbers from 0 to 65535.
    static Result<LogFilter> fromStartCommand(const Dictionary& command);

    /// False for a message that LogMessage::parse takes, of either stream, whose code is in no list. What is
    /// malformed always passes: the service does not judge it.
    [[nodiscard]] bool passes(Bytes message) const;

private:
    bool _everything = true;
    std::vector<bool> _codes;      ///< by code; 65536 of them unless everything passes
    std::vector<bool> _extraCodes; ///< likewise, of the extra stream
};

} // namespace velmora
