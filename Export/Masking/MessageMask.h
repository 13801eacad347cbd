// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/MaskReport.h"
#include "Export/Masking/MaskedPayloads.h"
#include "Export/Masking/PropertyLists/PropertyListMask.h"
#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "Export/Masking/RecordMask.h"
#include "Export/Masking/TimeShift.h"
#include "Platform/Bytes.h"
#include "Recording/MessageReader.h"

#include <chrono>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Masks log messages. The same values become the same pseudonyms in all messages that are masked with a key.
/// What is not known to be harmless is removed: bytes become 0, entries of property lists disappear. A
/// message keeps its length, but for property lists whose values become longer or shorter. Main thread only.
class MessageMask {
public:
    explicit MessageMask(const MaskOptions& options);
    ~MessageMask();
    MessageMask(const MessageMask&) = delete;
    MessageMask& operator=(const MessageMask&) = delete;

    /// Masks a message of a technology (a short name). Absent where it has to be left out: of a technology
    /// that is not known.
    [[nodiscard]] std::optional<LoggedMessage> mask(LoggedMessage message, std::string_view technology);

    /// Counts a message that the caller leaves out after all.
    void leaveOut() { ++_report.leftOut; }

    [[nodiscard]] const MaskReport& report() const { return _report; }
    [[nodiscard]] const MaskOptions& options() const { return _options; }
    /// What is subtracted from times; absent before the first message, and where times stay.
    [[nodiscard]] std::optional<std::chrono::nanoseconds> shift() const {
        return _shift.hasBegun() ? std::optional(_shift.shift()) : std::nullopt;
    }

private:
    struct Technology;
    using Buffer = std::vector<std::uint8_t>;

    [[nodiscard]] Technology* technologyOf(std::string_view name);
    [[nodiscard]] bool maskBytes(Buffer& bytes, Technology& technology, Time arrival);
    [[nodiscard]] bool maskRecord(Buffer& bytes, Technology& technology, Time arrival);
    [[nodiscard]] bool maskPayload(Buffer& bytes, std::size_t offset, PropertyListKind kind);
    [[nodiscard]] MaskedPayloads::Entry maskedPayload(Bytes payload, PropertyListKind kind);
    static void replacePayload(Buffer& bytes, std::size_t offset, Bytes masked);
    [[nodiscard]] bool clear(Buffer& bytes, std::size_t from, Masked what);
    [[nodiscard]] bool shiftStamp(Buffer& bytes, std::size_t offset) const;

    const MaskOptions _options;
    Pseudonyms _pseudonyms;
    MaskReport _report;
    PropertyListMask _propertyLists;
    MaskedPayloads _payloads;
    TimeShift _shift;
    std::map<std::string, std::unique_ptr<Technology>, std::less<>> _technologies;
};

} // namespace velmora
