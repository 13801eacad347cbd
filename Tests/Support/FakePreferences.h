// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Preferences.h"

#include <set>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Preferences in memory that keep what was asked of them, in order: "set DOMAIN KEY true", "synchronize
/// DOMAIN", "announce DOMAIN KEY".
class FakePreferences final : public Preferences {
public:
    std::vector<std::string> calls;
    std::set<std::string> trueOnes; ///< "DOMAIN KEY"

    [[nodiscard]] bool boolean(std::string_view domain, std::string_view key) const override {
        return trueOnes.contains(std::string(domain) + " " + std::string(key));
    }

    void setBoolean(std::string_view domain, std::string_view key, bool value) override {
        const std::string name = std::string(domain) + " " + std::string(key);
        if (value)
            trueOnes.insert(name);
        else
            trueOnes.erase(name);
        calls.push_back("set " + std::string(domain) + " " + std::string(key) + (value ? " true" : " false"));
    }
    void synchronize(std::string_view domain) override {
        calls.push_back("synchronize " + std::string(domain));
    }
    void announceChange(std::string_view domain, std::string_view key) override {
        calls.push_back("announce " + std::string(domain) + " " + std::string(key));
    }
};

} // namespace velmora
