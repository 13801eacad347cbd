// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/Parquet/PageCompressor.h"

#include <zstd.h>

#include <algorithm>
#include <new>

namespace velmora {

namespace {

/// Those above take longer than what they gain is worth; those below miss what repeats at some distance, as
/// times and message numbers of tables do.
constexpr int level = 6;

constexpr std::size_t usualSize = std::size_t{1} << 20;

} // namespace

struct PageCompressor::Context {
    ZSTD_CCtx* context = ZSTD_createCCtx();
    Context() {
        if (!context)
            throw std::bad_alloc();
    }
    ~Context() { ZSTD_freeCCtx(context); }
    Context(const Context&) = delete;
    Context& operator=(const Context&) = delete;
};

PageCompressor::PageCompressor() : _context(std::make_unique<Context>()) {}

PageCompressor::~PageCompressor() = default;

Bytes PageCompressor::compress(Bytes page) {
    const std::size_t most = ZSTD_compressBound(page.size());
    // A long text's page leaves no memory behind.
    if (_compressed.size() < most || _compressed.size() > std::max(most, usualSize))
        _compressed = std::vector<std::uint8_t>(std::max(most, usualSize));
    const std::size_t size = ZSTD_compressCCtx(_context->context, _compressed.data(), _compressed.size(),
                                               page.data(), page.size(), level);
    if (ZSTD_isError(size) != 0)
        throw std::bad_alloc(); // the only error that there can be with room enough
    return Bytes(_compressed).first(size);
}

} // namespace velmora
