// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "PropertyLists/Value.h"

#include <array>
#include <cstddef>
#include <cstdint>
#include <exception>
#include <optional>
#include <string_view>
#include <vector>

namespace velmora {

/// The extra stream's payload readers. Each is built from a complete record, reads the property list after
/// the 13-byte header and keeps the result.

/// A cache of a section's latest payloads and their values. The SIM's files and the contexts are sent
/// repeatedly without having changed, or as before, alternately in both forms: some of them are cached.
class PayloadCache {
public:
    /// What the record's payload holds, as readPropertyList returns it.
    [[nodiscard]] Result<Value> read(const Data& record);

private:
    struct Payload {
        std::vector<std::uint8_t> bytes;
        Value value;
    };
    std::array<Payload, 8> _payloads;
    std::size_t _next = 0; ///< which is replaced next
};

namespace LogCode_0xFF0000 {

/// A SIM-file payload that is no property list. It is not caught and ends the program, as intended.
class UnknownDataException : public std::exception {
public:
    [[nodiscard]] const char* what() const noexcept override {
        return "SIM File dictionary data could not be constructed";
    }
};

/// The SIM's elementary files by the telephony service's keys.
class SIMFileReader {
public:
    /// Logs and raises UnknownDataException when the payload cannot be read.
    SIMFileReader(const Data& record, PayloadCache& earlier);
    /// The value under `key`; null when there is none.
    [[nodiscard]] const Value* value(std::string_view key) const;
    /// What the payload holds, whatever its kind.
    [[nodiscard]] const Value& files() const { return _files; }

private:
    Value _files;
};

} // namespace LogCode_0xFF0000

/// The packet-data contexts: an array, or nothing where the payload is anything else or unreadable.
class ContextListReader {
public:
    ContextListReader(const Data& record, PayloadCache& earlier);
    [[nodiscard]] const Value& contexts() const { return _contexts; }

private:
    Value _contexts;
};

/// The cell information array: the cells that the phone sees, as the telephony service describes them.
class CellInfoArrayReader {
public:
    /// Logs "Cell Info Array data could not be constructed" when the payload cannot be read, and then holds
    /// none.
    explicit CellInfoArrayReader(const Data& record);
    /// What the payload holds, whatever its kind.
    [[nodiscard]] const Value& parsed() const { return _parsed; }
    /// The cells. Where there is no array - the payload is unreadable or of another kind - null, with the
    /// error line "Failed to get Cell Array".
    [[nodiscard]] const Array* cells() const;

private:
    Value _parsed;
};

/// Whether `cell` is a dictionary whose radio access technology and cell type are these two. One that
/// lacks either key is not.
[[nodiscard]] bool isCell(const Value& cell, std::string_view technology, std::string_view type);

/// A cell's number as a signed 32-bit integer. Absent where the key is missing or its value does not convert:
/// text, data and booleans are no numbers, and a number that has a fraction or does not fit 32 bits would
/// show as another one.
[[nodiscard]] std::optional<std::int32_t> cellNumber(const Dictionary& cell, std::string_view key);

} // namespace velmora
