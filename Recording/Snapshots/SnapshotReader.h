// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Recording/DLF/RecordChainReader.h"

#include <cstddef>
#include <memory>
#include <optional>
#include <string>
#include <utility>

namespace velmora {

/// Reads a snapshot: a property list, XML or binary, that holds "Timestamp", "Data" and "Description"; "Data"
/// is the history's entries, oldest first, and for the binary technologies a DLF log.
///
/// An entry is one refresh. Its "DisplayState" has the raw messages of the refresh: of the binary
/// technologies the messages as they arrived, one after the other; of the serialized-object technology the
/// object of the last message before it, which is serialized again and is the entry's one message. An entry
/// without raw messages is skipped; if no entry has any, the messages are those of the DLF log, if there is
/// one, with DLFReader's times.
///
/// The last message of an entry has the refresh, at the entry's "Date"; an entry without a readable date is 2
/// s after the previous one, and the first one at the snapshot's "Timestamp". An entry whose messages cannot
/// be read, or that has none, has no refresh. The dates have a resolution of a second, and the messages'
/// times are only known to lie between two refreshes: they are distributed over the 2 s before their own, or
/// over what is left of these after the previous refresh, in proportion to their offsets.
///
/// A message's offset is that in its entry's raw messages, 0 for a serialized object; losses name the entry,
/// numbered from 1. Records are numbered from 1 through all entries. The file is one property list and is
/// read into memory: at most 256 MiB. Main thread only.
class SnapshotReader final : public RecordChainReader {
public:
    /// Opens an input of which nothing has been skipped, and reads all of it. Fails when it cannot be read,
    /// or is no snapshot.
    static Result<std::unique_ptr<SnapshotReader>> open(ChunkedInput input);

    [[nodiscard]] std::string_view form() const override { return "snapshot"; }
    /// Always none: an input that cannot be read to its end is not opened.
    [[nodiscard]] const std::optional<Failure>& failure() const override { return _failure; }

protected:
    [[nodiscard]] std::optional<LoggedMessage> read() override;

private:
    explicit SnapshotReader(const Dictionary& snapshot);

    void openEntry(const Value& entry);
    void openRecords(const Data& bytes, RecordChain::Layout layout);
    void openObject(const Value& object);
    [[nodiscard]] std::optional<LoggedMessage> nextOfEntry();
    [[nodiscard]] std::string place() const;

    ArrayRef _entries; ///< null where there are none
    Time _timestamp{};
    bool _hasRawMessages = false; ///< some entry has
    bool _isBinary = false;       ///< the first entry with raw messages has bytes
    bool _isLog = false;          ///< the current messages are the DLF log's
    std::size_t _nextEntry = 0;
    std::optional<RecordChain> _records;   ///< of the current entry
    std::optional<LoggedMessage> _pending; ///< of the current entry: the last one, unless another follows
    std::optional<Time> _refresh;          ///< of the current entry
    Time _begin{};                         ///< start of its messages' times
    std::size_t _size = 0;                 ///< of its raw messages
    std::optional<Failure> _failure;
};

} // namespace velmora
