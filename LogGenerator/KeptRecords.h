// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <vector>

namespace velmora {

/// The latest record of each view (each log code) of a section, until it is written into the display.
///
/// A display is handed out every two seconds and its records arrive dozens of times in between, so that text
/// is made from the last of them only. Nothing that is shown depends on when that happens: records are
/// written in the order of their arrival, one that sets less than the one that it would replace does not
/// replace it, and one whose labels may not be there yet is written at once, which fixes the order of the
/// keys.
///
/// Keeping a record allocates nothing once there has been one as long.
class KeptRecords {
public:
    /// What a record sets, a bit for each part that it may lack. Most have one part.
    using Parts = std::uint32_t;

    struct Kept {
        std::vector<std::uint8_t> bytes;
        std::uint64_t order = 0; ///< of arrival, from 1; 0 when there is nothing to write
        Parts parts = 0;         ///< of the record that is kept
        Parts shown = 0;         ///< of all that have been written
        [[nodiscard]] bool isPending() const { return order != 0; }
    };

    explicit KeptRecords(std::size_t views = 0) : _kept(views) {}
    void resize(std::size_t views) { _kept.resize(views); }

    [[nodiscard]] const Kept& operator[](std::size_t view) const { return _kept[view]; }

    /// Whether what is pending has to be written before a record with these parts replaces it.
    [[nodiscard]] bool wouldLose(std::size_t view, Parts parts) const {
        return _kept[view].isPending() && (_kept[view].parts & ~parts) != 0;
    }
    /// Keeps a record. Whether all has to be written now, since it has parts that were never written.
    [[nodiscard]] bool keep(std::size_t view, Bytes bytes, Parts parts) {
        Kept& kept = _kept[view];
        if (kept.bytes.size() != bytes.size()) // most records of a view are as long as the one before
            kept.bytes.resize(bytes.size());
        std::copy(bytes.begin(), bytes.end(), kept.bytes.begin());
        kept.parts = parts;
        kept.order = ++_lastOrder;
        _latest = view;
        return (parts & ~kept.shown) != 0;
    }
    /// Nothing is pending but, perhaps, this view: it replaces what the others would write.
    void dropAllBut(std::size_t view) {
        for (std::size_t i = 0; i < _kept.size(); ++i)
            if (i != view)
                _kept[i].order = 0;
    }
    /// Nothing is pending, and nothing has been written: the display is another.
    void clear();

    /// A number that is one more after each kept record, and another, but never by one, after `clear`.
    [[nodiscard]] const std::uint64_t& changes() const { return _lastOrder; }
    /// The view of the record that was kept last, whether or not it has been written. Precondition: there has
    /// been one.
    [[nodiscard]] std::size_t latest() const { return _latest; }

    /// Calls `write(view, bytes)` for each pending record in the order of arrival. One whose writing throws
    /// stays pending with those after it.
    template <class Write>
    void writeAll(Write write) {
        for (std::size_t view = earliest(); view != none; view = earliest()) {
            Kept& kept = _kept[view];
            write(view, Bytes(kept.bytes));
            kept.order = 0;
            kept.shown |= kept.parts;
        }
    }

private:
    static constexpr std::size_t none = ~std::size_t{0};
    /// The view whose pending record arrived first; none where nothing is pending.
    [[nodiscard]] std::size_t earliest() const;

    std::vector<Kept> _kept;
    std::uint64_t _lastOrder = 0;
    std::size_t _latest = 0;
};

} // namespace velmora
