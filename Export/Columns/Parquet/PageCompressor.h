// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstdint>
#include <memory>
#include <vector>

namespace velmora {

/// Compresses pages by Zstandard. One is enough for all files of a thread.
class PageCompressor {
public:
    PageCompressor();
    ~PageCompressor();
    PageCompressor(const PageCompressor&) = delete;
    PageCompressor& operator=(const PageCompressor&) = delete;

    /// Valid until the next call.
    [[nodiscard]] Bytes compress(Bytes page);

private:
    struct Context;
    std::unique_ptr<Context> _context;
    std::vector<std::uint8_t> _compressed;
};

} // namespace velmora
