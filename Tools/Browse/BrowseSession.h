// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Data/BrowsedFile.h"
#include "Tools/Browse/Data/MessageCursor.h"
#include "Tools/Browse/Data/MessageInspector.h"
#include "Tools/Browse/Data/MessageRow.h"
#include "Tools/Browse/Passes/EventPass.h"
#include "Tools/Browse/Passes/FilterPass.h"
#include "Tools/Browse/Passes/SearchPass.h"

#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// A recording that is looked into, without a screen: which message is chosen, which are listed, notes,
/// the marked range, searches. What takes long is done in steps by `work`. Main thread only.
class BrowseSession {
public:
    /// Rules are needed once the file has been read; the function's result must outlive this.
    using Rules = std::function<const RuleSet&()>;

    static Result<std::unique_ptr<BrowseSession>> open(const std::string& path, const std::string& technology,
                                                       const std::optional<MaskOptions>& masking,
                                                       Rules rules);

    /// Goes on with what is going on, for some milliseconds. Whether there is more to do.
    bool work();
    /// What is going on, for people: "reading, 42 %"; empty for nothing.
    [[nodiscard]] std::string progress() const;
    /// What a search, a filter or a move has come to; empty once it has been taken.
    [[nodiscard]] std::string takeNews() { return std::exchange(_news, std::string()); }

    /// How many messages are listed, and the index of the chosen one among them.
    [[nodiscard]] std::uint64_t listed() const;
    [[nodiscard]] std::uint64_t chosen() const;
    /// The position of the chosen message in the file; 0 without messages.
    [[nodiscard]] std::uint64_t position() const { return _position; }
    [[nodiscard]] bool isEmpty() const { return listed() == 0; }
    [[nodiscard]] std::vector<MessageRow> rows(std::uint64_t first, std::size_t count);
    /// The chosen message; null where there is none.
    [[nodiscard]] const InspectedMessage* message();

    void choose(std::uint64_t index);
    void chooseLast();
    /// The first listed message at or after that position.
    void choosePosition(std::uint64_t position);
    void chooseTime(Time time);
    /// Whether there is one.
    bool chooseEvent(SearchPass::Direction direction);

    /// Fails for a text that is no filter; an empty one lists all messages.
    Result<Done> setFilter(const std::string& text);
    [[nodiscard]] std::string filter() const { return _filter ? _filter->text() : std::string(); }
    void search(const std::string& text, SearchPass::Direction direction);
    void stopSearch() { _search.reset(); }
    [[nodiscard]] bool isSearching() const { return _search != nullptr; }

    /// An empty text takes the note away.
    void setNote(const std::string& text);
    [[nodiscard]] std::string note(std::uint64_t position) const;
    [[nodiscard]] const std::map<std::uint64_t, std::string>& notes() const { return _notes; }
    [[nodiscard]] bool hasUnwrittenNotes() const { return _hasUnwritten; }
    /// The range begins with the chosen message and ends with whichever is chosen; or there is none any more.
    void toggleMark();
    /// The positions of its first and its last message; absent where nothing is marked.
    [[nodiscard]] std::optional<std::pair<std::uint64_t, std::uint64_t>> marked() const;
    /// Writes the marked range, or all, with the notes, to a new recording. Returns how many messages.
    Result<std::uint64_t> write(const std::string& path);

    /// The technologies of which the file has messages, as far as it has been read, from the one after this
    /// session's on; empty where that is the only one.
    [[nodiscard]] std::vector<std::string> otherTechnologies() const;

    [[nodiscard]] const BrowsedFile& file() const { return *_file; }
    /// Null until the file has been read.
    [[nodiscard]] const EventPass* events() const { return _events.get(); }

private:
    BrowseSession(std::unique_ptr<BrowsedFile> file, Rules rules);
    [[nodiscard]] std::optional<std::uint64_t> positionAt(std::uint64_t index) const;
    [[nodiscard]] std::uint64_t positionOf(Time time);
    void takePending();
    bool workOn();

    std::unique_ptr<BrowsedFile> _file;
    Rules _rules;
    MessageCursor _cursor;
    MessageInspector _inspector;
    std::unique_ptr<FilterPass> _filter;
    std::unique_ptr<SearchPass> _search;
    std::unique_ptr<EventPass> _events;
    std::uint64_t _position = 0;
    bool _wantsLast = false;         ///< once all has been read
    std::optional<Time> _wantedTime; ///< the same
    std::optional<std::uint64_t> _mark;
    std::map<std::uint64_t, std::string> _notes;
    bool _hasUnwritten = false;
    std::string _news;
};

} // namespace velmora
