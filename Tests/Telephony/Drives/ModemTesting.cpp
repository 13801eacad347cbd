// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/Drives/ModemTesting.h"

#include "PropertyLists/PropertyList.h"
#include "Telephony/Drives/Modem/ModemScenario.h"

#include <limits>

namespace velmora {

std::int64_t ModemAccount::number(std::string_view key, std::int64_t otherwise) const {
    const std::int64_t* number = (*this)[key].asInteger();
    return number ? *number : otherwise;
}

std::vector<const Dictionary*> ModemAccount::rows(std::string_view key) const {
    std::vector<const Dictionary*> rows;
    if (const Array* array = (*this)[key].asArray())
        for (const Value& each : *array)
            rows.push_back(each.asDictionary());
    return rows;
}

Value modemRoot(const LogMessage& message) {
    if (message.type != LogMessage::extraType)
        return {};
    const auto list = readPropertyList(message.record.subspan(LogMessage::headerLength));
    return list && list->asDictionary() ? *list : Value();
}

const std::vector<ModemAccount>& modemAccounts() {
    static const std::vector<ModemAccount> accounts = [] {
        std::vector<ModemAccount> all;
        for (const ScenarioEvent& event : driveOf<ModemScenario>(1, std::chrono::minutes(20))) {
            const auto message = LogMessage::parse(event.message.bytes());
            const Value root = message ? modemRoot(*message) : Value();
            // Of the unusual ones, a text in place of a number marks what is out of range.
            if (root.isNone() || message->prefixed || (*root.asDictionary())[kVoxModemCellReport].asString())
                continue;
            all.push_back({std::chrono::duration<double>(event.offset).count(), message->logCode(), root});
        }
        return all;
    }();
    return accounts;
}

double numberOf(const Dictionary& dictionary, std::string_view key) {
    const Value& value = dictionary[key];
    if (const std::int64_t* whole = value.asInteger())
        return static_cast<double>(*whole);
    const double* real = value.asReal();
    return real ? *real : std::numeric_limits<double>::quiet_NaN();
}

} // namespace velmora
