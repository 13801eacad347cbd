// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <map>
#include <string>
#include <string_view>

namespace velmora {

/// Logs a recurring fault once and not at every retry: a line per subject, at warning priority, and another
/// only when the text has changed or the fault was cleared in between. Main thread only.
class FaultLog {
public:
    /// Precondition: the subject is one of few; it is not shown.
    void report(std::string_view subject, const std::string& text);
    /// Clears the subject's fault: its next fault is logged again.
    void clear(std::string_view subject);

private:
    std::map<std::string, std::string, std::less<>> _reported; ///< the last text by subject
};

} // namespace velmora
