// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/OpenMessages.h"

#include <map>
#include <string>
#include <vector>

namespace velmora {

/// The technologies of files, each of which is read once for that, when it is first asked for.
class FileTechnologies {
public:
    /// None for standard input and for what cannot be read.
    [[nodiscard]] const std::vector<std::string>& of(const std::string& file) {
        const auto found = _technologies.find(file);
        return found != _technologies.end() ? found->second
                                            : _technologies.emplace(file, technologiesOf(file)).first->second;
    }

private:
    std::map<std::string, std::vector<std::string>> _technologies;
};

} // namespace velmora
