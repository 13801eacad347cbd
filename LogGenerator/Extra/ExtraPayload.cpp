// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Extra/ExtraPayload.h"

#include "Platform/SystemLog.h"

#include <utility>

namespace velmora {

LogCode_0xFF0000::SIMFileReader::SIMFileReader(const Data& record, PayloadCache& earlier) {
    Result<Value> payload = earlier.read(record);
    if (!payload) {
        logLine(LogPriority::Error, "SIM File dictionary data could not be constructed");
        throw UnknownDataException();
    }
    _files = *std::move(payload);
}

const Value* LogCode_0xFF0000::SIMFileReader::value(std::string_view key) const {
    const Dictionary* files = _files.asDictionary();
    return files ? files->find(key) : nullptr;
}

ContextListReader::ContextListReader(const Data& record, PayloadCache& earlier) {
    Result<Value> payload = earlier.read(record);
    if (payload && payload->asArray())
        _contexts = *std::move(payload);
}

} // namespace velmora
