// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/PeerLog.h"

#include "Platform/SystemLog.h"

#include <chrono>
#include <cinttypes>
#include <cstdarg>
#include <cstdint>
#include <cstdio>
#include <map>
#include <string>

namespace velmora {

/// The kinds of which a line was written less than a second ago.
class PeerLog::Seconds {
public:
    ~Seconds() {
        for (const auto& [kind, second] : _kinds)
            report(kind, second);
    }

    /// Whether a line of the kind may be written; `isFirst` becomes whether a second begins with it.
    [[nodiscard]] bool admit(std::string_view kind, int priority, bool& isFirst) {
        const auto [found, isNew] = _kinds.try_emplace(kind, Second{priority, 0, 0});
        isFirst = isNew;
        Second& second = found->second;
        if (second.lines < linesPerSecond) {
            ++second.lines;
            return true;
        }
        ++second.leftOut;
        return false;
    }

    void end(std::string_view kind) {
        const auto ended = _kinds.extract(kind);
        if (!ended.empty())
            report(ended.key(), ended.mapped());
    }

private:
    struct Second {
        int priority;
        std::size_t lines;
        std::uint64_t leftOut;
    };

    static void report(std::string_view kind, const Second& second) {
        if (second.leftOut > 0)
            logFormat(second.priority, "%.*s: %" PRIu64 " more within a second",
                      static_cast<int>(kind.size()), kind.data(), second.leftOut);
    }

    std::map<std::string_view, Second> _kinds;
};

PeerLog::PeerLog(MainQueue& queue) : _queue(queue), _seconds(std::make_shared<Seconds>()) {}

PeerLog::~PeerLog() = default;

void PeerLog::line(int priority, const char* kind, std::string_view text) {
    if (!isLogged(priority))
        return;
    bool isFirst = false;
    const bool isWritten = _seconds->admit(kind, priority, isFirst);
    if (isFirst)
        _queue.after(std::chrono::seconds(1), [weak = std::weak_ptr(_seconds), kind] {
            if (const auto seconds = weak.lock())
                seconds->end(kind);
        });
    if (isWritten)
        logLine(priority, text);
}

void PeerLog::format(int priority, const char* kind, const char* pattern, ...) {
    if (!isLogged(priority))
        return;
    std::va_list arguments;
    va_start(arguments, pattern);
    std::va_list again;
    va_copy(again, arguments);
    const int length = std::vsnprintf(nullptr, 0, pattern, arguments);
    va_end(arguments);
    if (length >= 0) {
        std::string text(static_cast<std::size_t>(length), '\0');
        std::vsnprintf(text.data(), text.size() + 1, pattern, again);
        line(priority, kind, text);
    }
    va_end(again);
}

} // namespace velmora
