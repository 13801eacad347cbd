// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <functional>
#include <map>
#include <string>
#include <string_view>

namespace velmora {

/// Tells of what does not work once and not at every try: a line a subject, at warning priority, and another
/// only when the words have changed or the fault has been over in between. Main thread only.
class FaultLog {
public:
    /// Precondition: the subject is one of few; it is not shown.
    void tell(std::string_view subject, const std::string& text);
    /// The subject works: the next fault of it is told again.
    void over(std::string_view subject);

private:
    std::map<std::string, std::string, std::less<>> _told; ///< the last text by subject
};

} // namespace velmora
