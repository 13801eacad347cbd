// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Messages/TechnologyChoice.h"

#include "Platform/PrintableText.h"
#include "Platform/TelephonyService.h"
#include "Tools/Technologies.h"

#include <algorithm>

namespace velmora {

namespace {

/// "holds Ostrel_GSM and Ostrel_LTE".
std::string holdingText(const std::vector<std::string>& technologies) {
    std::string text = "holds ";
    for (std::size_t i = 0; i < technologies.size(); ++i) {
        if (i > 0)
            text += i + 1 == technologies.size() ? " and " : ", ";
        text += printable(technologies[i]);
    }
    return text;
}

} // namespace

Result<TechnologyChoice> TechnologyChoice::make(const std::string& name,
                                                const std::vector<std::string>& technologies) {
    TechnologyChoice choice;
    if (name.empty())
        return choice;
    const Result<std::string> constant = technologyNamed(name);
    if (!constant)
        return Failure{constant.reason()};
    const std::string wanted(shortTechnologyName(*constant));
    if (technologies.size() < 2) {
        choice.override = wanted;
        return choice;
    }
    const auto found = std::find(technologies.begin(), technologies.end(), wanted);
    if (found == technologies.end())
        return Failure{holdingText(technologies) + ", wanted one of these and not " + wanted};
    choice.only = static_cast<std::uint32_t>(found - technologies.begin());
    return choice;
}

std::string TechnologyChoice::nameOf(std::uint32_t technology,
                                     const std::vector<std::string>& technologies) const {
    if (!override.empty())
        return override;
    return technology < technologies.size() ? technologies[technology] : std::string();
}

std::vector<std::string> knownTechnologies(const std::vector<std::string>& beforehand,
                                           const MessageReader& reader) {
    std::vector<std::string> met = reader.technologies();
    return met.size() > beforehand.size() ? met : beforehand;
}

std::string severalTechnologies(const std::vector<std::string>& technologies) {
    return holdingText(technologies) + "; --technology chooses one";
}

} // namespace velmora
