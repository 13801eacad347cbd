// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Expression/InputNames.h"

#include "Analysis/Rules/Expression/PathLeaves.h"
#include "LogGenerator/Observations/PathPattern.h"

#include <algorithm>
#include <optional>
#include <string>

namespace velmora {

namespace {

using Kind = ExpressionType::Kind;

constexpr std::string_view detectedName = "neighbour.detected";
constexpr std::string_view technologyName = "radio.technology";
constexpr std::string_view modeName = "radio.mode";

ExpressionType typeOf(const RoleName& row) {
    switch (row.role) {
    case Role::ServingCountryCode:
    case Role::ServingNetworkCode: return textType;
    case Role::RegistrationState:
    case Role::RadioState: return {Kind::Enumeration};
    case Role::ServingPhysicalCell: return {Kind::Any}; // GSM's colour code is a text in some displays
    default: return numberType(row.unit);
    }
}

std::optional<ExpressionType> typeOf(const CatalogueField& leaf) {
    switch (leaf.kind) {
    case ObservedKind::Number: return numberType(leaf.unit);
    case ObservedKind::Enumeration: return ExpressionType{Kind::Enumeration};
    case ObservedKind::Flag: return truthType;
    case ObservedKind::Text: return textType;
    case ObservedKind::Binary:
    case ObservedKind::Absent: break;
    }
    return std::nullopt;
}

std::string inQuotes(const std::vector<std::string>& texts) {
    std::string list;
    for (const std::string& text : texts)
        list += (list.empty() ? "'" : ", '") + text + "'";
    return list;
}

/// The type in all catalogues that have it; absent, with a reason, where they differ or none has it.
struct TypeSearch {
    std::optional<ExpressionType> type;
    std::string technology; ///< that has it so
    bool hasFreeRows = false;
    bool isBytes = false;
    std::string reason;

    void add(const Catalogue& catalogue, const PathLeaf& found) {
        hasFreeRows = hasFreeRows || std::count(found.rows.begin(), found.rows.end(), std::nullopt) > 0;
        const std::optional<ExpressionType> own = typeOf(*found.leaf);
        isBytes = isBytes || found.leaf->kind == ObservedKind::Binary;
        if (!own)
            return;
        if (type && *type != *own && reason.empty())
            reason = "it is " + describe(*type) + " in " + technology + " and " + describe(*own) + " in " +
                     catalogue.technology() + ", wanted a rule with technology = \"...\"";
        type = own;
        technology = catalogue.technology();
    }
};

} // namespace

Result<RuleInput> InputNames::named(std::string_view name) {
    using Input = RuleInput::Kind;
    std::vector<std::string_view> names;
    for (const RoleName& row : roleNames()) {
        if (row.name == name)
            return RuleInput{name.starts_with("neighbour.") ? Input::StrongestNeighbour : Input::Role,
                             row.role,
                             {},
                             typeOf(row)};
        names.push_back(row.name);
    }
    if (name == detectedName)
        return RuleInput{Input::StrongestNeighbour, Role::None, {}, truthType};
    if (name == technologyName)
        return RuleInput{Input::RadioTechnology, Role::None, {}, textType};
    if (name == modeName)
        return RuleInput{Input::RadioMode, Role::None, {}, textType};
    names.insert(names.end(), {detectedName, technologyName, modeName});
    return Failure{"got the name " + std::string(name) + ", wanted a role; the nearest are " +
                   nearestNames(name, names)};
}

Result<RuleInput> InputNames::at(std::string_view path) const {
    const auto found = _paths.find(path);
    if (found != _paths.end())
        return found->second;
    if (_paths.size() == mostPaths)
        return Failure{"got more than " + std::to_string(mostPaths) + " different paths"};
    return _paths.emplace(path, find(path)).first->second;
}

Result<RuleInput> InputNames::find(std::string_view path) const {
    TypeSearch search;
    bool isOpen = false;
    bool isNode = false;
    const PathPattern pattern{std::string(path)};
    for (const Catalogue* const catalogue : _catalogues) {
        const std::vector<PathLeaf> leaves = leavesAt(*catalogue, path);
        for (const PathLeaf& each : leaves)
            search.add(*catalogue, each);
        const bool isFurther = leaves.empty() && canHaveFurtherLeaf(*catalogue, path);
        isOpen = isOpen || (isFurther && _further == Further::ArePossible);
        isNode = isNode || (!isFurther && pattern.isPossible(*catalogue));
    }
    if (!search.reason.empty())
        return Failure{"'" + std::string(path) + "': " + search.reason};
    const RuleInput::Kind kind = search.hasFreeRows || (!search.type && path.find("/*") != path.npos)
                                     ? RuleInput::Kind::EachRow
                                     : RuleInput::Kind::Path;
    if (search.type)
        return RuleInput{kind, Role::None, std::string(path), *search.type};
    if (search.isBytes)
        return Failure{"'" + std::string(path) + "' holds bytes, wanted a number, a text or a flag"};
    if (isOpen)
        return RuleInput{kind, Role::None, std::string(path), {Kind::Any}};
    return Failure{"got the path '" + std::string(path) + "', wanted " +
                   (isNode ? "one with a value; " : "one of a display; ") + "the nearest are " +
                   inQuotes(nearestPaths(_catalogues, path))};
}

bool canReport(const Catalogue& catalogue, const RuleInput& input) {
    if (input.isPath())
        return !leavesAt(catalogue, input.path).empty() || canHaveFurtherLeaf(catalogue, input.path);
    const auto hasRole = [&catalogue](Role role) {
        return std::any_of(catalogue.fields().begin(), catalogue.fields().end(),
                           [role](const CatalogueField& leaf) { return leaf.role == role; });
    };
    switch (input.kind) {
    case RuleInput::Kind::RadioTechnology: return true;
    case RuleInput::Kind::RadioMode: return hasRole(Role::RadioState);
    default: return hasRole(input.role == Role::None ? Role::NeighbourPhysicalCell : input.role);
    }
}

std::string nearestNames(std::string_view text, std::span<const std::string_view> names) {
    constexpr std::size_t most = 3;
    std::vector<std::pair<std::size_t, std::string_view>> ranked;
    for (const std::string_view name : names)
        ranked.emplace_back(editDistance(text, name), name);
    std::sort(ranked.begin(), ranked.end());
    std::string list;
    for (std::size_t i = 0; i < std::min(most, ranked.size()); ++i)
        list.append(list.empty() ? "" : ", ").append(ranked[i].second);
    return list;
}

} // namespace velmora
