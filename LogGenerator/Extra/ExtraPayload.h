// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Extra/PayloadCache.h"
#include "PropertyLists/Value.h"

#include <exception>
#include <string_view>

namespace velmora {

/// The readers of the SIM's files and of the packet-data contexts. Each is built from a complete record,
/// reads the property list after the 13-byte header and keeps the result.

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

} // namespace velmora
