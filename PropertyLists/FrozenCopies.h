// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>
#include <vector>

namespace velmora {

/// The frozen copies that were made of one node. The history asks for a copy of the whole display every two
/// seconds and drops it ten seconds later: a node that has not changed gives the copy that it gave before,
/// and one that has changed writes into a copy that nobody holds any more. So the history takes the time of
/// what has changed, and no memory beyond its own.
///
/// A copy of the owning node starts without any.
template <class Node>
class FrozenCopies {
public:
    FrozenCopies() = default;
    FrozenCopies(const FrozenCopies&) noexcept {}
    FrozenCopies& operator=(const FrozenCopies& other) noexcept {
        if (this != &other) {
            _kept.clear();
            _latest = 0;
            _whole = false;
        }
        return *this;
    }
    ~FrozenCopies() = default;

    /// The copy made last, where the node has not changed since then; null otherwise.
    [[nodiscard]] std::shared_ptr<Node> latest(std::uint64_t changes) const {
        return _whole && _changes == changes ? _kept[_latest] : nullptr;
    }
    /// The node's number of changes is another, but what is observed has not changed.
    void renumber(std::uint64_t from, std::uint64_t to) {
        if (_changes == from)
            _changes = to;
    }

    /// A copy that nobody but this holds, or a new node, to be written into. It is not the latest before
    /// `finish`.
    [[nodiscard]] const std::shared_ptr<Node>& next() {
        _whole = false;
        for (std::size_t i = 0; i < _kept.size(); ++i) {
            _latest = _latest + 1 < _kept.size() ? _latest + 1 : 0;
            if (_kept[_latest].use_count() == 1)
                return _kept[_latest];
        }
        if (_kept.size() < maximum) {
            _kept.push_back(std::make_shared<Node>());
            _latest = _kept.size() - 1;
        } else {
            _kept[_latest] = std::make_shared<Node>();
        }
        return _kept[_latest];
    }
    /// The node that `next` gave has been written.
    void finish(std::uint64_t changes) {
        _changes = changes;
        _whole = true;
    }

private:
    /// The history's five, one that it is about to drop, one that is being made, and one to spare.
    static constexpr std::size_t maximum = 8;

    std::vector<std::shared_ptr<Node>> _kept;
    std::size_t _latest = 0;
    bool _whole = false;        ///< the latest has been finished
    std::uint64_t _changes = 0; ///< the node's, when it was
};

} // namespace velmora
