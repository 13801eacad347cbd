// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Log/DecoderLines.h"
#include "Tools/LogOverride.h"

#include <functional>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

/// Counts the lines about the connection to the telephony service, which repeat with each attempt to connect,
/// and reports each change of the connection's error. Writes all other lines.
class ServiceLog final : public LogOverride {
public:
    /// `lines` must outlive it. `changed` gets the current error, once for each change: "no telephony service
    /// answers".
    explicit ServiceLog(DecoderLines& lines, std::function<void(const std::string& problem)> changed = {})
        : _lines(lines), _changed(std::move(changed)) {}

    void write(int priority, std::string_view text) override;

    /// The connection's current error, as far as the log shows it; empty for none.
    [[nodiscard]] const std::string& problem() const { return _problem; }
    /// The connection is good now.
    void clearProblem() {
        _problem.clear();
        _attemptFailed = true;
    }

private:
    void setProblem(const std::string& problem);

    DecoderLines& _lines;
    std::function<void(const std::string& problem)> _changed;
    std::string _problem;
    bool _attemptFailed = true; ///< the next problem is of another attempt to connect
};

} // namespace velmora
