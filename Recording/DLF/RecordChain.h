// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/DLF/RecordCandidate.h"
#include "Recording/DLF/RecordWeights.h"
#include "Recording/DLF/RestoredMessages.h"
#include "Recording/Files/ChunkedInput.h"
#include "Recording/MessageReader.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <utility>

namespace velmora {

/// Log records without gaps, split by their length fields: the raw messages of a display, or a DLF log.
/// Returns each as the message that arrived at the port.
///
/// In raw messages a message begins with its type byte, or with two bytes of prefix before that, and its
/// length counts what follows the type. A DLF log has records without type byte; those in the middle of one
/// of the application's buffers still have theirs, and their prefix; a prefixed record at a buffer's
/// beginning has only the prefix's second byte and the type left. Nothing in the log marks which of these a
/// record is: the candidate with the highest score is chosen (RecordCandidate), from its type byte, code and
/// time stamp and from what follows it. A type byte that is missing is restored from the code (impliedType).
///
/// Where no record leads to another one, reading resumes at the next offset where one reliably does. The
/// look-ahead is at most about 200 KB, damage of any length is skipped in bounded memory, and time is
/// proportional to the input's size for any content. Main thread only.
class RecordChain {
public:
    enum class Layout : std::uint8_t { RawMessages, DLF };

    struct Record {
        Data message;
        std::uint64_t offset = 0;    ///< its offset in the input
        std::uint64_t timestamp = 0; ///< unchanged from the record (see RecordTime.h)
        bool isVersionReport = false;
    };

    RecordChain(ChunkedInput input, Layout layout, const RecordWeights& weights = {})
        : _input(std::move(input)), _layout(layout), _weights(weights) {}

    /// Whether the input begins as a DLF log's version report does, or with a record that no other input is
    /// likely to begin with. Call it before the first `next`.
    [[nodiscard]] bool looksLikeRecords();
    /// The next record; none at the end or once reading has failed.
    [[nodiscard]] std::optional<Record> next();
    /// What was skipped before the record, or the end, that `next` last returned; without its record number.
    [[nodiscard]] std::optional<Loss> takeLoss() { return std::exchange(_loss, std::nullopt); }
    /// What has been read and not returned yet.
    [[nodiscard]] Bytes available() const { return _input.available(); }
    /// The read error that ended the input; absent if there was none.
    [[nodiscard]] const std::optional<Failure>& failure() const { return _input.failure(); }

private:
    /// The candidates at the current bytes.
    struct Survey {
        std::optional<RecordCandidate> linked;    ///< ends where another record begins, or the input ends
        std::optional<RecordCandidate> plain;     ///< has the score of a record itself
        std::optional<RecordCandidate> truncated; ///< likewise, but reaches past the end of the input
    };

    /// What the current bytes most likely are.
    struct Ranking {
        RecordCandidate best; ///< by its own score
        int others;           ///< the most that another candidate there scores
    };

    [[nodiscard]] bool allows(Framing framing) const;
    [[nodiscard]] std::optional<Ranking> rankAt(std::size_t at, std::optional<std::uint64_t> nearby);
    [[nodiscard]] std::optional<RecordCandidate> evident();
    [[nodiscard]] std::optional<RecordCandidate> candidateAt(std::size_t at, Framing framing,
                                                             std::optional<std::uint64_t> nearby);
    [[nodiscard]] int scoreAt(std::size_t at, std::optional<std::uint64_t> nearby);
    [[nodiscard]] bool scoreFollower(std::size_t at, RecordCandidate& candidate);
    [[nodiscard]] bool isConvincingAt(std::size_t at, int least, std::optional<std::uint64_t> nearby);
    [[nodiscard]] bool containsBetterRecord(const RecordCandidate& candidate);
    [[nodiscard]] Survey survey();
    [[nodiscard]] Record take(const RecordCandidate& candidate);
    void skipDamage(const Survey& survey);

    ChunkedInput _input;
    Layout _layout;
    RecordWeights _weights;
    std::size_t _present = 0;                ///< size of the record that `next` last returned
    std::optional<std::uint64_t> _timestamp; ///< the last valid one
    std::optional<Ranking> _follower;        ///< what `evident` saw after the record that it returned
    RestoredMessages _restored;
    std::optional<Loss> _loss;
};

} // namespace velmora
