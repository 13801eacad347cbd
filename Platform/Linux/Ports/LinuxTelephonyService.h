// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MessagePort.h"
#include "Platform/TelephonyService.h"

namespace velmora {

/// The domains of the errors that the telephony service's calls end with.
namespace VoxErrorDomain {
inline constexpr std::int32_t Transport = 1; ///< the code is a PortStatus
inline constexpr std::int32_t Service = 2;   ///< the code is the service's own
} // namespace VoxErrorDomain

/// The telephony service's client calls over message ports. A connection is one to the service's port; its
/// callback runs when the service goes away. The caller keeps `ports` alive for as long as this lives. Calls
/// block the main thread for up to a second to send and a second for the answer.
class LinuxTelephonyService final : public TelephonyService {
public:
    explicit LinuxTelephonyService(MessagePorts& ports) : _ports(ports) {}

    [[nodiscard]] std::shared_ptr<VoxServerConnection>
    _VoxServerConnectionCreate(std::function<void()> callback) override;

    /// An answer that is no property list, or has no port name, is success with an empty name. Precondition:
    /// `connection` comes from this class.
    [[nodiscard]] VoxError
    _VoxServerConnectionNetworkMonitorCreateLogChannel(VoxServerConnection& connection,
                                                       const std::string& localPortName,
                                                       std::string& remotePortName) override;

private:
    MessagePorts& _ports;
};

} // namespace velmora
