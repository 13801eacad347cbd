// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/SystemLog.h"

#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// The system log of a test: keeps its lines. It is the process's log for as long as it lives, and puts the
/// earlier one back when it ends, so that such logs nest. Main thread only.
class CapturedLog final : public SystemLog {
public:
    struct Line {
        int priority = 0;
        std::string text;

        friend bool operator==(const Line&, const Line&) = default;
    };

    explicit CapturedLog(int level = LogPriority::Debug)
        : _earlierLevel(detail::systemLogLevel), _earlier(setSystemLog(this, level)) {}
    ~CapturedLog() override { setSystemLog(_earlier, _earlierLevel); }
    CapturedLog(const CapturedLog&) = delete;
    CapturedLog& operator=(const CapturedLog&) = delete;

    void write(int priority, std::string_view text) override {
        _lines.push_back({priority, std::string(text)});
    }

    [[nodiscard]] const std::vector<Line>& lines() const { return _lines; }

    /// The texts of one priority, in the order in which they were written.
    [[nodiscard]] std::vector<std::string> textsAt(int priority) const {
        std::vector<std::string> texts;
        for (const Line& line : _lines)
            if (line.priority == priority)
                texts.push_back(line.text);
        return texts;
    }

    /// Whether there is a line of just this priority and text.
    [[nodiscard]] bool contains(int priority, std::string_view text) const {
        return std::any_of(_lines.begin(), _lines.end(), [priority, text](const Line& line) {
            return line.priority == priority && line.text == text;
        });
    }

    void clear() { _lines.clear(); }

private:
    int _earlierLevel;
    SystemLog* _earlier;
    std::vector<Line> _lines;
};

} // namespace velmora
