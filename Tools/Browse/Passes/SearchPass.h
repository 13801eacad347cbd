// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Observation.h"
#include "Tools/Browse/Data/BrowsedFile.h"
#include "Tools/Browse/Data/MessageCursor.h"
#include "Tools/Browse/Data/PositionedDecoder.h"

#include <cstdint>
#include <functional>
#include <optional>
#include <string>

namespace velmora {

/// Looks for the next message, or the one before, that has a text: in the name of its code, its comments, or
/// the path or value of anything that it reports. Letters of ASCII match in either case. It decodes from one
/// checkpoint of the index to the next, in steps. Main thread only.
class SearchPass final : private ObservationSink {
public:
    enum class Direction : bool { Forward, Backward };
    struct Query {
        std::string text;
        Direction direction = Direction::Forward;
        std::uint64_t from = 0; ///< the position that is not looked at
        /// Whether a message is listed, and what else of it is searched.
        std::function<bool(std::uint64_t position)> isListed;
        std::function<std::string(std::uint64_t position)> noteOf;
    };

    /// The file must outlive it.
    SearchPass(const BrowsedFile& file, Query query);
    SearchPass(const SearchPass&) = delete;
    SearchPass& operator=(const SearchPass&) = delete;

    /// Searches from one checkpoint to the next. False once it has ended: see `found`.
    bool step();
    [[nodiscard]] const std::optional<std::uint64_t>& found() const { return _found; }
    /// Why the latest message could not be read; empty where it could.
    [[nodiscard]] const std::string& failure() const { return _cursor.failure(); }
    /// How far it has got.
    [[nodiscard]] std::uint64_t position() const { return _begin; }
    [[nodiscard]] const Query& query() const { return _query; }

private:
    void observed(const ObservedMessage& message) override;
    [[nodiscard]] bool wantsRowKeys() const override { return false; }
    void searchTo(std::uint64_t end);
    [[nodiscard]] bool has(std::string text) const;
    [[nodiscard]] bool isMatch(const LoggedMessage& message, std::uint64_t position);

    const BrowsedFile& _file;
    Query _query;
    MessageCursor _cursor;
    PositionedDecoder _decoder;
    std::uint64_t _begin; ///< forward: all before it is done; backward: all from it on
    bool _isReported = false;
    ObservedText _text;
    std::string _path;
    std::optional<std::uint64_t> _found;
};

} // namespace velmora
