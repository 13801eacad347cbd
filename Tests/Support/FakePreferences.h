// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Preferences.h"

#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Preferences that only keep what was asked of them, in order: "set DOMAIN KEY true", "synchronize DOMAIN",
/// "announce DOMAIN KEY".
class FakePreferences final : public Preferences {
public:
    std::vector<std::string> calls;

    void setBoolean(std::string_view domain, std::string_view key, bool value) override {
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
