// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/ServiceClient.h"

#include <string>

#include <unistd.h>

namespace velmora {

ModelPlatform ServiceClient::platform() {
    return {ports, queue, telephony, clock, []() -> std::optional<std::string> {
                return logChannelPortName("com.velmora.log." + std::to_string(::getpid()));
            }};
}

} // namespace velmora
