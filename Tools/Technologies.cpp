// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Technologies.h"

#include "Platform/TelephonyService.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

struct Form {
    std::string_view text;
    std::string_view technology;
};

/// The short form of each technology, as engineers write it.
constexpr std::array forms = {
    Form{"IFX", kVoxLogChannelTechnology_IFX},
    Form{"GSM", kVoxLogChannelTechnology_Ostrel_GSM},
    Form{"CDMA", kVoxLogChannelTechnology_Ostrel_CDMA},
    Form{"LTE", kVoxLogChannelTechnology_Ostrel_LTE},
    Form{"UTRAN", kVoxLogChannelTechnology_Ostrel_UTRAN2},
    Form{"Modem", kVoxLogChannelTechnology_Modem},
};
static_assert(forms.size() == voxTechnologies.size());

bool isSameInAnyCase(std::string_view a, std::string_view b) {
    const auto lower = [](char c) { return c >= 'A' && c <= 'Z' ? static_cast<char>(c - 'A' + 'a') : c; };
    return std::equal(a.begin(), a.end(), b.begin(), b.end(),
                      [lower](char one, char other) { return lower(one) == lower(other); });
}

} // namespace

std::optional<std::string> technologyMeantBy(std::string_view text) {
    if (isTechnology(text))
        return std::string(text);
    for (const Form& form : forms)
        for (const std::string_view name : {form.text, shortTechnologyName(form.technology), form.technology})
            if (isSameInAnyCase(text, name))
                return std::string(shortTechnologyName(form.technology));
    return std::nullopt;
}

std::string technologyForms() {
    std::string text;
    for (const Form& form : forms) {
        const std::string_view name = shortTechnologyName(form.technology);
        text += text.empty() ? "" : ", ";
        text += form.text;
        if (name != form.text)
            text.append(" (").append(name).append(")");
    }
    return text;
}

Result<std::string> technologyNamed(std::string_view name) {
    if (name.empty())
        return Failure{"names no technology, wanted one of " + technologyNames()};
    if (!isTechnology(name))
        return Failure{"technology \"" + std::string(name) + "\" is unknown, wanted one of " +
                       technologyNames()};
    return technologyConstant(name);
}

Result<std::unique_ptr<LogGenerator>> makeDecoder(std::string_view technology, const Clock& clock) {
    const Result<std::string> constant = technologyNamed(technology);
    if (!constant)
        return Failure{constant.reason()};
    std::unique_ptr<LogGenerator> decoder = LogGenerator::generatorFromTechnology(*constant, clock);
    if (!decoder)
        return Failure{"technology " + std::string(shortTechnologyName(*constant)) + " has no decoder here"};
    return decoder;
}

} // namespace velmora
