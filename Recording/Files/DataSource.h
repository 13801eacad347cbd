// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/ByteSource.h"

#include "Platform/Bytes.h"

#include <algorithm>
#include <utility>

namespace velmora {

/// Bytes in memory. Main thread only.
class DataSource final : public ByteSource {
public:
    explicit DataSource(Data data) : _rest(std::move(data)) {}

    Result<std::size_t> read(std::span<std::uint8_t> buffer) override {
        const std::size_t count = std::min(buffer.size(), _rest.size());
        std::copy_n(_rest.bytes().begin(), count, buffer.begin());
        _rest = _rest.from(count);
        return count;
    }

private:
    Data _rest;
};

} // namespace velmora
