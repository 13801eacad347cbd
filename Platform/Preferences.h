// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string_view>

namespace velmora {

/// Preferences of this process and of others, each a value under a key of the process's domain
/// ("com.velmora.HomeScreen"). Failures are error lines in the log. Main thread only.
class Preferences {
public:
    virtual ~Preferences() = default;
    /// The value; false where there is none, and where the preferences cannot be read.
    [[nodiscard]] virtual bool boolean(std::string_view domain, std::string_view key) const = 0;
    /// Sets the value for this process; others see it from `synchronize` on.
    virtual void setBoolean(std::string_view domain, std::string_view key, bool value) = 0;
    /// Writes what was set in the domain to where its process reads it; everything else there stays.
    virtual void synchronize(std::string_view domain) = 0;
    /// Announces to listeners that the value changed, so that they reload it.
    virtual void announceChange(std::string_view domain, std::string_view key) = 0;
};

} // namespace velmora
