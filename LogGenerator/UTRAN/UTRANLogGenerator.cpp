// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANLogGenerator.h"

#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"

#include <algorithm>

namespace velmora {

namespace {

constexpr std::string_view wanted = "UTRAN";

bool matches(std::string_view name) {
    const auto equal = [](char letter, char upper) {
        return (letter >= 'a' && letter <= 'z' ? static_cast<char>(letter - 'a' + 'A') : letter) == upper;
    };
    return std::search(name.begin(), name.end(), wanted.begin(), wanted.end(), equal) != name.end();
}

std::string joined(const std::vector<std::string>& names) {
    std::string result;
    for (const std::string& name : names) {
        result += result.empty() ? "" : ", ";
        result += name;
    }
    return result.empty() ? "none" : result;
}

} // namespace

UTRANLogGenerator::UTRANLogGenerator(std::string templateName, const Clock& clock)
    : OstrelLogGenerator2(std::move(templateName), std::make_shared<UTRANClassIndex>(), clock) {
    logLine(LogPriority::Error, "Created UTRANLogGenerator object");
}

std::unique_ptr<UTRANLogGenerator> UTRANLogGenerator::generator(const Clock& clock) {
    const std::vector<std::string> names = resources().list("plist");
    const auto found = std::find_if(names.begin(), names.end(), matches);
    if (found == names.end()) {
        logFormat(LogPriority::Error, "resources of type plist are %s, wanted one whose name contains %s",
                  joined(names).c_str(), wanted.data());
        return nullptr;
    }
    return std::unique_ptr<UTRANLogGenerator>(new UTRANLogGenerator(*found, clock));
}

} // namespace velmora
