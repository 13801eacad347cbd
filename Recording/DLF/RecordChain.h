// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/ChunkedInput.h"
#include "Recording/MessageReader.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <utility>

namespace velmora {

/// Log records that stand one behind the other with nothing between them, taken apart by the length that
/// each of them holds: the raw material of a display, or a DLF log. Gives each as the message that arrived at
/// the port.
///
/// In raw material a message begins with its type byte, or with two bytes of prefix before that, and its
/// length counts what follows the type. A DLF log has records without type byte; those that lie in the middle
/// of one of the application's buffers have theirs nevertheless, and their prefix, and of a prefixed first
/// one only the prefix's second byte and the type are left. Which of these a record is, is nowhere said: what
/// fits best is taken, by its type byte, code and time stamp, and by what follows where it ends. A record
/// whose type byte is gone gets 0xFF put back where its code is one of the extra stream's (0 to 2), else 1.
///
/// Where no record leads to another one, reading goes on at the next place where one surely does. At most
/// about 200 KB are looked ahead, damage of any length is passed in bounded memory, and time is proportional
/// to the input's size whatever it holds. Main thread only.
class RecordChain {
public:
    enum class Layout : std::uint8_t { RawMaterial, DLF };

    struct Record {
        Data message;
        std::uint64_t offset = 0;    ///< where in the input it begins
        std::uint64_t timestamp = 0; ///< as it stands in the record (see RecordTime.h)
        bool isVersionReport = false;
    };

    RecordChain(ChunkedInput input, Layout layout) : _input(std::move(input)), _layout(layout) {}

    /// Whether the input begins as a DLF log's version report does, or with a record that no other input is
    /// likely to begin with. To be asked before the first `next`.
    [[nodiscard]] bool beginsSurely();
    /// The next record; none at the end, or when reading failed, and ever after.
    [[nodiscard]] std::optional<Record> next();
    /// What was left out before the record, or the end, that `next` last gave; without its record number.
    [[nodiscard]] std::optional<Loss> takeLoss() { return std::exchange(_loss, std::nullopt); }
    /// What has been read and not given out.
    [[nodiscard]] Bytes available() const { return _input.available(); }
    /// The read error that ended the input; absent while there was none.
    [[nodiscard]] const std::optional<Failure>& failure() const { return _input.failure(); }

private:
    /// What stands before a record's length field.
    enum class Lead : std::uint8_t {
        Type,      ///< the type, of either stream
        Prefix,    ///< two bytes that begin 0x81, and the type
        Nothing,   ///< DLF alone
        CutPrefix, ///< the prefix's second byte, and the type; DLF alone
        OtherType, ///< a type that is neither stream's
    };

    static constexpr Lead everyLead[] = {Lead::Type, Lead::Prefix, Lead::Nothing, Lead::CutPrefix,
                                         Lead::OtherType};

    /// A record that the bytes may be.
    struct Candidate {
        Lead lead = Lead::Type;
        std::size_t size = 0; ///< in the input
        std::uint16_t length = 0;
        std::uint16_t code = 0;
        std::uint64_t timestamp = 0;
        int evidence = 0; ///< that it is one, of itself
        int onward = 0;   ///< and by what stands at its end

        [[nodiscard]] int total() const { return evidence + onward; }
        [[nodiscard]] bool isVersionReport() const;
    };

    /// What the bytes at hand may be.
    struct Survey {
        std::optional<Candidate> linked; ///< ends where another record begins, or the input ends
        std::optional<Candidate> plain;  ///< looks like a record itself
        std::optional<Candidate> cutOff; ///< that too, but reaches past the end of the input
    };

    [[nodiscard]] static std::size_t sizeOf(Lead lead);
    [[nodiscard]] bool mayHave(Lead lead) const;
    [[nodiscard]] std::optional<Candidate> candidateAt(std::size_t at, Lead lead,
                                                       std::optional<std::uint64_t> nearby);
    [[nodiscard]] int evidenceAt(std::size_t at, std::optional<std::uint64_t> nearby);
    [[nodiscard]] bool judge(std::size_t at, Candidate& candidate);
    [[nodiscard]] bool isSureAt(std::size_t at, int least);
    [[nodiscard]] bool holdsBetter(const Candidate& candidate);
    [[nodiscard]] Survey survey();
    [[nodiscard]] Record take(const Candidate& candidate);
    void passDamage(const Survey& survey);

    ChunkedInput _input;
    Layout _layout;
    std::size_t _present = 0;                ///< size of the record that `next` last gave
    std::optional<std::uint64_t> _timestamp; ///< the last good one
    std::optional<Loss> _loss;
};

} // namespace velmora
