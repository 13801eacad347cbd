// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/SnapshotNotice.h"

#include "Toolkit/Alert.h"
#include "Toolkit/Folder.h"

#include <cstddef>

namespace velmora {

Notice SnapshotNotice::before(Notice other) const {
    if (_path.empty())
        return other;
    const std::size_t slash = _path.rfind('/');
    const std::string folder = slash == std::string::npos ? "." : _path.substr(0, slash);
    const std::string text = "Saved " + _path.substr(slash + 1) + " in " + folder + ".";
    other.text = other.text.empty() ? text : text + " " + other.text;
    if (other.title.empty()) {
        other.title = "Open Folder";
        other.action = [folder] {
            if (!openFolder(folder))
                Alert("No File Manager", "Nothing here opens " + folder, "Close").show();
        };
    }
    return other;
}

} // namespace velmora
