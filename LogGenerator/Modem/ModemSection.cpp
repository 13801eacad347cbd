// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemSection.h"

#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Modem/Values/TypedValue.h"
#include "LogGenerator/Observations/ContentVisitor.h"
#include "LogMessages/LiveModem.h"
#include "Platform/SystemLog.h"

namespace velmora {

using LiveModem::dictionaryOf;

void ModemSection::updateWithData(const Data& data, std::uint32_t logCode) {
    trace();
    const View* const view = viewOf(logCode);
    if (!view) {
        unknownCode(logCode);
        return;
    }
    Value message = read(data, logCode);
    if (reportsErrors() && !message.isNone())
        checkMessage(*message.asDictionary());
    keep(*view, Record(Bytes()), 1, [this, &message] { _message = std::move(message); });
}

Value ModemSection::read(const Data& data, std::uint32_t logCode) const {
    const Result<Value> payload = _payloads->read(data);
    if (payload && payload->asDictionary())
        return *payload;
    observeDamage(Damage::Unreadable);
    if (reportsErrors()) {
        const std::string why =
            payload ? "the root is of kind " + std::string(nameOf(payload->kind())) + ", wanted a dictionary"
                    : payload.reason();
        logFormat(LogPriority::Error, "Record 0x%04X: %s", static_cast<unsigned>(logCode), why.c_str());
    }
    return {};
}

void ModemSection::decode(const View&, const Record&, FieldVisitor& visitor) const {
    const Dictionary& message = dictionaryOf(_message);
    const std::optional<std::string> trouble = LiveModem::troubleOf(message);
    visitor.beginWhole();
    if (_message.isNone())
        visitor.text(_state, "Unreadable message");
    else
        visitor.text(_state, trouble ? *trouble : stateOf(message));
    if (const auto reason = LiveModem::textOf(message[kVoxModemReason]))
        visitor.text(_reason, *reason);
    show(LiveModem::isModemAbsent(message) ? dictionaryOf({}) : message, visitor);
    visitor.endWhole();
}

void ModemSection::describe(const View&, ContentVisitor& visitor) const {
    visitor.field(_state);
    visitor.field(_reason);
    describeShown(visitor);
}

std::string ModemSection::stateOf(const Dictionary& message) const {
    return LiveModem::workingState(message);
}

void ModemSection::checkMessage(const Dictionary&) const {}

} // namespace velmora
