// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/Files/OutputFile.h"

namespace velmora {

std::string_view OutputFile::describe(Change::Kind kind) {
    switch (kind) {
    case Change::Kind::None: break;
    case Change::Kind::Removed: return "was removed";
    case Change::Kind::Moved: return "was moved away";
    case Change::Kind::Replaced: return "was replaced by another file";
    case Change::Kind::Truncated: return "was truncated";
    case Change::Kind::Altered: return "was written to by another program";
    }
    return {};
}

} // namespace velmora
