// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Ports/PeerUser.h"

#include "Platform/Linux/Errno.h"

#include <sys/socket.h>

#include <cerrno>
#include <string>

namespace velmora {

Result<Done> checkPeerUser(int descriptor, uid_t wanted) {
    ucred peer = {};
    socklen_t size = sizeof peer;
    if (::getsockopt(descriptor, SOL_SOCKET, SO_PEERCRED, &peer, &size) != 0)
        return Failure{"a peer of unknown user: " + errnoText(errno)};
    if (peer.uid != wanted)
        return Failure{"a peer of user " + std::to_string(peer.uid) + ", wanted user " +
                       std::to_string(wanted)};
    return Done();
}

} // namespace velmora
