// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Recording/Comments.h"
#include "Recording/Positions/PositionSentence.h"

#include <cstddef>
#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// The longest log message that a port takes, and so the longest in a recording, in bytes.
inline constexpr std::size_t maximumMessageSize = std::size_t{16} << 20;

/// One log message of a file.
struct LoggedMessage {
    Time time;                ///< when it arrived
    Data message;             ///< exactly as it arrived at the port; may be a window into a larger buffer
    std::uint64_t number = 0; ///< its number among the file's records, from 1, lost records included
    std::uint64_t offset = 0; ///< where in the file its record begins, in bytes
    /// The refresh between this message and the next, where the file records refreshes, as a snapshot does.
    /// In such a file these are all refreshes, whatever the messages' times.
    std::optional<Time> refresh = std::nullopt;
    std::uint32_t technology = 0; ///< which of the reader's `technologies` it belongs to
};

/// A part of the file that should have been a message but could not be read.
struct Loss {
    std::uint64_t offset = 0; ///< its offset in the file, in bytes
    std::uint64_t bytes = 0;  ///< how many bytes of the file were skipped
    std::uint64_t recordNumber =
        0;                     ///< the lost record's number, or that of the next record where none is known
    std::string reason;        ///< lower-case prose
    bool isTruncation = false; ///< the file is truncated inside a record, as when its writer was killed
};

/// A file read as a stream of log messages, front to back, whatever its form. What cannot be read is skipped
/// and reported as a loss; what follows it is still read. Main thread only.
class MessageReader {
public:
    /// How many losses are kept one by one; the totals count them all.
    static constexpr std::size_t maximumLosses = 100;

    struct LossTotals {
        std::uint64_t losses = 0;
        std::uint64_t bytes = 0;
    };

    virtual ~MessageReader() = default;
    MessageReader(const MessageReader&) = delete;
    MessageReader& operator=(const MessageReader&) = delete;

    /// The next message; none at the end of the file, or once reading has failed (see `failure`).
    [[nodiscard]] virtual std::optional<LoggedMessage> next() = 0;
    /// The short name of the technology whose messages these are ("Ostrel_GSM"); empty while it is unknown.
    /// Where the file holds several, the first one that it names.
    [[nodiscard]] virtual const std::string& technology() const = 0;
    /// The short names of all technologies that the file has named so far, in its order.
    [[nodiscard]] virtual std::vector<std::string> technologies() const;
    /// Whether `next` returns the messages of all technologies; the default is those of the first alone, and
    /// the others are losses.
    virtual void setReadsAllTechnologies(bool) {}
    /// Passes on the sentences of the file's receiver of positions, in calls of `next`, in the file's order
    /// between the messages; an empty function for none, which is the default. Files of other forms than
    /// recordings have none.
    virtual void setSentences(PositionSentences) {}
    /// The file's form, for messages: "recording", "snapshot", "DLF log".
    [[nodiscard]] virtual std::string_view form() const { return "recording"; }
    /// Whether the file is gzip'd; offsets are those in what it unpacks to.
    [[nodiscard]] bool isCompressed() const { return _isCompressed; }
    void setCompressed() { _isCompressed = true; }
    /// The read error that ended the stream early; absent when it ended with the file.
    [[nodiscard]] virtual const std::optional<Failure>& failure() const = 0;

    /// The first losses so far, in the file's order.
    [[nodiscard]] const std::vector<Loss>& losses() const { return _losses; }
    /// All losses so far.
    [[nodiscard]] const LossTotals& lossTotals() const { return _lossTotals; }
    /// The comments so far.
    [[nodiscard]] const Comments& comments() const { return _comments; }
    /// Those since the last call; see Comments::takeNew.
    [[nodiscard]] std::vector<Comment> takeNewComments() { return _comments.takeNew(); }

protected:
    MessageReader() = default;
    /// Whether the next loss will be kept, so that its reason is worth composing.
    [[nodiscard]] bool keepsLoss() const { return _losses.size() < maximumLosses; }
    void addLoss(Loss loss);
    /// Where the losses are another reader's, of which not all are kept.
    void setLossTotals(const LossTotals& totals) { _lossTotals = totals; }
    void addComment(Comment comment) { _comments.add(std::move(comment)); }

private:
    std::vector<Loss> _losses;
    LossTotals _lossTotals;
    Comments _comments;
    bool _isCompressed = false;
};

} // namespace velmora
