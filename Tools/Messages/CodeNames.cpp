// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/CodeNames.h"

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/OstrelLogGenerator2.h"

#include <algorithm>

namespace velmora {

namespace {

/// The sections that want the code, each once.
std::vector<std::string> sectionsOf(const ClassIndex& index, std::uint32_t code) {
    const std::vector<Base*>* sections = index.getSubscribers(code);
    std::vector<std::string> names;
    if (sections)
        for (const Base* section : *sections)
            if (std::find(names.begin(), names.end(), section->getSectionName()) == names.end())
                names.emplace_back(section->getSectionName());
    return names;
}

} // namespace

CodeNames codeNames(const LogGenerator* decoder) {
    CodeNames names;
    if (const auto* withSections = dynamic_cast<const OstrelLogGenerator2*>(decoder))
        names.namesOf = [withSections](std::uint32_t code) {
            return sectionsOf(withSections->classIndex(), code);
        };
    if (dynamic_cast<const C2KLogGenerator*>(decoder)) {
        names.heading = "records";
        names.namesOf = [](std::uint32_t code) {
            const C2K::LogCodeParser* parser = C2K::parserOfCode(code);
            return parser ? std::vector<std::string>{std::string(parser->name())}
                          : std::vector<std::string>();
        };
    }
    return names;
}

} // namespace velmora
