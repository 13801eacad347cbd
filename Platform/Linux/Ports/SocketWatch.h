// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>

namespace velmora {

/// Watches a file descriptor on the event loop and runs the action in every iteration in which it is ready.
/// The watch does not own the descriptor and has to be destroyed before it is closed; the owner may do so
/// from the action. Main thread only.
class SocketWatch {
public:
    enum class For { Reading, Writing };

    SocketWatch(int descriptor, For what, std::function<void()> action);
    ~SocketWatch();
    SocketWatch(const SocketWatch&) = delete;
    SocketWatch& operator=(const SocketWatch&) = delete;

    /// A watch is enabled when it is made.
    void setEnabled(bool enabled);

private:
    class Impl;
    Impl* _impl;
};

} // namespace velmora
