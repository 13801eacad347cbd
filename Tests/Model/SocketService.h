// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <sys/types.h>

namespace velmora {

/// A telephony service in a process of its own, over real sockets in `directory`. It answers "GetTechnology"
/// as `manner` says and, once it gets the start command, sends a registration record every 20 ms. Killed in
/// the end.
///
/// Manners: "normal"; "late", after the time that the application waits; "rubbish"; "unknown", a technology
/// without a decoder; "no-answer", a dictionary without one; "no-data", a reply without data.
class SocketService {
public:
    SocketService(const std::string& directory, const std::string& manner);
    ~SocketService();
    SocketService(const SocketService&) = delete;
    SocketService& operator=(const SocketService&) = delete;

    /// Ends it as a crash would.
    void kill();

    /// The service's own main function: what the test program does when it is started as the service.
    static int main(const std::string& directory, const std::string& manner);

private:
    pid_t _id = -1;
};

} // namespace velmora
