// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/Notice.h"

#include <string>
#include <utility>

namespace velmora {

/// What the bar above the panes says about the snapshot that was saved last: its name, its place, and a
/// button that opens the folder.
class SnapshotNotice {
public:
    void setPath(std::string path) { _path = std::move(path); }
    /// Empty where there is nothing to say.
    [[nodiscard]] const std::string& path() const { return _path; }
    void clear() { _path.clear(); }

    /// The other notice with this before it. The button stays the other's where it has one.
    [[nodiscard]] Notice before(Notice other) const;

private:
    std::string _path;
};

} // namespace velmora
