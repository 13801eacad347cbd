// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Resources.h"

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Replaces the process's resources during its lifetime, and records the first that could not be read. A
/// decoder logs that and continues without its template, as on a phone, but its display then lacks part of
/// the file. Main thread only; the destructor restores the earlier resources.
class TrackedResources final : public Resources {
public:
    TrackedResources() : _others(setResources(this)) {}
    ~TrackedResources() override { setResources(_others); }
    TrackedResources(const TrackedResources&) = delete;
    TrackedResources& operator=(const TrackedResources&) = delete;

    [[nodiscard]] Result<Data> read(std::string_view name, std::string_view type) const override {
        Result<Data> content = _others->read(name, type);
        if (!content && _failure.empty())
            _failure = content.reason();
        return content;
    }
    [[nodiscard]] std::vector<std::string> list(std::string_view type) const override {
        return _others->list(type);
    }
    [[nodiscard]] std::optional<std::string> bundleVersion() const override {
        return _others->bundleVersion();
    }
    [[nodiscard]] std::string buildStamp() const override { return _others->buildStamp(); }

    /// Why the first could not be read; empty where all could.
    [[nodiscard]] const std::string& failure() const { return _failure; }

private:
    Resources* _others;
    mutable std::string _failure;
};

} // namespace velmora
