// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Support/ShippedResources.h"

#include <fstream>
#include <iterator>
#include <stdexcept>
#include <string>

namespace velmora {

Data shippedResource(std::string_view fileName) {
    const std::string path = std::string(VELMORA_SOURCE_DIR "/Resources/").append(fileName);
    std::ifstream file(path, std::ios::binary);
    if (!file)
        throw std::runtime_error(std::string("cannot read ").append(path));
    return Data(std::vector<std::uint8_t>(std::istreambuf_iterator<char>(file), {}));
}

} // namespace velmora
