// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Service/LogFilter.h"

#include "LogMessages/LogMessage.h"
#include "Platform/TelephonyService.h"

#include <string>

namespace velmora {
namespace {

constexpr std::size_t codeCount = 0x10000;

Result<std::vector<bool>> codesOf(const Dictionary& command, std::string_view key) {
    std::vector<bool> codes(codeCount);
    const Value* list = command.find(key);
    if (!list)
        return codes;
    const Array* array = list->asArray();
    const std::string name(key);
    if (!array)
        return Failure{name + " is of kind " + std::string(nameOf(list->kind())) + ", wanted an array"};
    for (const Value& each : *array) {
        const std::int64_t* code = each.asInteger();
        if (!code)
            return Failure{name + " holds a value of kind " + std::string(nameOf(each.kind())) +
                           ", wanted numbers from 0 to 65535"};
        if (*code < 0 || *code >= static_cast<std::int64_t>(codeCount))
            return Failure{name + " holds " + std::to_string(*code) + ", wanted numbers from 0 to 65535"};
        codes[static_cast<std::size_t>(*code)] = true;
    }
    return codes;
}

} // namespace

Result<LogFilter> LogFilter::fromStartCommand(const Dictionary& command) {
    LogFilter filter;
    filter._everything =
        !command.contains(vox::setOstrelLogCodesKey) && !command.contains(vox::setVoxExtraCodesKey);
    if (filter._everything)
        return filter;
    auto codes = codesOf(command, vox::setOstrelLogCodesKey);
    if (!codes)
        return Failure{codes.reason()};
    auto extraCodes = codesOf(command, vox::setVoxExtraCodesKey);
    if (!extraCodes)
        return Failure{extraCodes.reason()};
    filter._codes = *std::move(codes);
    filter._extraCodes = *std::move(extraCodes);
    return filter;
}

bool LogFilter::passes(Bytes message) const {
    if (_everything)
        return true;
    const auto header = LogMessage::parse(message);
    if (!header)
        return true;
    if (header->type == LogMessage::basebandType)
        return _codes[header->code];
    if (header->type == LogMessage::extraType)
        return _extraCodes[header->code];
    return true;
}

} // namespace velmora
