// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Platform/Bytes.h"
#include "Tests/LogGenerator/Observations/RandomModemMessages.h"

#include <cstdint>
#include <optional>
#include <random>
#include <vector>

namespace velmora {

/// Messages that no modem would send, of the log codes that a decoder asks for: random contents and lengths,
/// a drive's messages with some bytes changed, and the telephony service's lists with random values; of a
/// decoder that asks for no codes, random trees of texts; of a live modem's, those of RandomModemMessages.
class RandomMessages {
public:
    RandomMessages(const LogGenerator& decoder, std::vector<Data> drive, std::uint64_t seed);

    [[nodiscard]] Data next();

private:
    [[nodiscard]] std::int64_t between(std::int64_t least, std::int64_t most);
    [[nodiscard]] std::uint8_t byte();
    [[nodiscard]] Data randomRecord();
    [[nodiscard]] Data changedMessage();
    [[nodiscard]] Data serviceRecord();
    [[nodiscard]] Value cell();
    [[nodiscard]] Value context();
    [[nodiscard]] Value simFiles();
    [[nodiscard]] Value anything(int depth);
    [[nodiscard]] Value tree(int depth);

    std::mt19937_64 _random;
    std::vector<Data> _drive;
    std::vector<std::uint16_t> _codes;
    bool _hasService = false;
    std::optional<RandomModemMessages> _ofModem;
    int _contents = 0; ///< how the bytes of this record are chosen
};

} // namespace velmora
