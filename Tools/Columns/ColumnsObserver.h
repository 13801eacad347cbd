// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Columns/InputColumns.h"
#include "Tools/Decode/Decoding.h"

namespace velmora {

/// Passes what decoding a file reports to its tables.
class ColumnsObserver final : public DecodingObserver {
public:
    explicit ColumnsObserver(InputColumns& columns) : _columns(columns) {}

    void didMakeDecoder(LogGenerator& decoder) override {
        decoder.setObservationSink(&_columns.add(decoder.catalogue()));
    }
    void willConcern(const Decoded& decoded) override { _columns.select(decoded.technology); }
    void willDecode(const LoggedMessage& message) override {
        _columns.willDecode({message.number, message.time, message.message.size()});
    }
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    /// Nothing more can be written.
    [[nodiscard]] bool isDone() const override { return _columns.failure().has_value(); }

private:
    InputColumns& _columns;
};

} // namespace velmora
