// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"

#include <cstddef>
#include <memory>
#include <string_view>

namespace velmora {

/// The log lines that peers of the program can provoke. Of each kind at most ten a second are written; those
/// beyond are counted, and the count is a line when the second is over or the log is destroyed. So a hostile
/// peer fills neither the log nor the processor. Main thread only.
class PeerLog {
public:
    static constexpr std::size_t linesPerSecond = 10;

    /// `queue` must outlive the log.
    explicit PeerLog(MainQueue& queue);
    ~PeerLog();
    PeerLog(const PeerLog&) = delete;
    PeerLog& operator=(const PeerLog&) = delete;

    /// `kind` begins the line with the count: "refused connections: 53 more within a second". It is a
    /// literal, and every line of the kind has the same priority.
    void line(int priority, const char* kind, std::string_view text);
    /// The line formatted as printf(3) does.
    void format(int priority, const char* kind, const char* pattern, ...)
        __attribute__((format(printf, 4, 5)));

private:
    class Seconds;

    MainQueue& _queue;
    std::shared_ptr<Seconds> _seconds; ///< queued tasks hold it weakly
};

} // namespace velmora
