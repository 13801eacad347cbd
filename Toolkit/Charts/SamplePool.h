// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <memory>
#include <vector>

namespace velmora {

class SampleBlock;
class SampleRing;

/// The blocks of a store's rings: at most a fixed number. When all are in use the next one is taken from the
/// longest series (of several the one that was made first), which loses its oldest entries; a series with no
/// more than its share of the blocks so never loses any to others. Used blocks are kept for the next to need
/// one.
class SamplePool {
public:
    explicit SamplePool(std::size_t blockLimit);
    ~SamplePool();
    SamplePool(const SamplePool&) = delete;
    SamplePool& operator=(const SamplePool&) = delete;

    void add(SampleRing& ring);
    void remove(SampleRing& ring);
    /// An empty block.
    [[nodiscard]] std::unique_ptr<SampleBlock> take();
    void giveBack(std::unique_ptr<SampleBlock> block);

    [[nodiscard]] std::size_t blockCount() const { return _made; }

private:
    std::vector<SampleRing*> _rings;
    std::vector<std::unique_ptr<SampleBlock>> _spare;
    std::size_t _limit;
    std::size_t _made = 0;
};

} // namespace velmora
