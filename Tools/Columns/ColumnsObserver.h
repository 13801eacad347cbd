// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/InputColumns.h"
#include "Export/Tracks/PositionedReader.h"
#include "Tools/Columns/ReaderNews.h"
#include "Tools/Decode/Decoding.h"

namespace velmora {

/// Passes what reading and decoding a file reports to its tables.
class ColumnsObserver final : public DecodingObserver {
public:
    /// All must outlive it. `reader`: that of the messages as they are decoded.
    /// `positions`: null where the tables are to have none.
    ColumnsObserver(InputColumns& columns, const MessageReader& reader, const PositionedReader* positions)
        : _columns(columns), _news(reader), _positions(positions) {}

    void didMakeDecoder(LogGenerator& decoder) override {
        decoder.setObservationSink(&_columns.add(decoder.catalogue()));
    }
    void willConcern(const Decoded& decoded) override {
        endMessage();
        _columns.select(decoded.technology);
    }
    void willDecode(const LoggedMessage& message) override {
        endMessage();
        _latest = message.number;
        _news.passLosses(message.number, _columns);
        _columns.willDecode({message.number, message.time, message.message.size(),
                             _positions ? _positions->position() : std::nullopt});
    }
    /// There are no more messages.
    void finish() {
        endMessage();
        _news.passEnd(_columns);
    }
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    /// Nothing more can be written.
    [[nodiscard]] bool isDone() const override { return _columns.failure().has_value(); }

private:
    void endMessage() {
        _columns.endMessage();
        _news.passNotes(_latest, _columns);
    }

    InputColumns& _columns;
    ReaderNews _news;
    const PositionedReader* _positions;
    std::uint64_t _latest = 0; ///< the latest message's number
};

} // namespace velmora
