// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Classes/LevelClasses.h"

#include <algorithm>

namespace velmora {

namespace {

/// The first name of a path, which is shortened by it.
std::string_view takeName(std::string_view& path) {
    path.remove_prefix(path.starts_with('/') ? 1 : 0);
    const std::string_view name = path.substr(0, path.find('/'));
    path.remove_prefix(name.size());
    return name;
}

/// Whether the path is the pattern's, in which a `*` is any name or row.
bool fits(std::string_view pattern, std::string_view path) {
    while (!pattern.empty() && !path.empty()) {
        const std::string_view wanted = takeName(pattern);
        if (const std::string_view name = takeName(path); wanted != "*" && wanted != name)
            return false;
    }
    return pattern.empty() && path.empty();
}

Role roleWithLimits(Role role) {
    switch (role) {
    case Role::NeighbourLevel: return Role::ServingLevel;
    case Role::NeighbourQuality: return Role::ServingQuality;
    default: return role;
    }
}

std::optional<LevelClass> classBy(const LevelLimits* limits, double value) {
    return limits ? limits->of(value) : std::nullopt;
}

} // namespace

std::optional<LevelClass> LevelClasses::of(std::optional<RadioTechnology> technology, Role role,
                                           double value) const {
    return classBy(limits(technology, role), value);
}

std::optional<LevelClass> LevelClasses::ofPath(std::string_view path, double value) const {
    return classBy(limitsOfPath(path), value);
}

const LevelLimits* LevelClasses::limits(std::optional<RadioTechnology> technology, Role role) const {
    if (!technology || role == Role::None)
        return nullptr;
    const auto found = std::find_if(_entries.begin(), _entries.end(), [&](const Entry& each) {
        return each.subject.role == roleWithLimits(role) && each.subject.technology == *technology;
    });
    return found == _entries.end() ? nullptr : &found->limits;
}

const LevelLimits* LevelClasses::limitsOfPath(std::string_view path) const {
    // A path that is written out precedes one with a `*`.
    const auto find = [&](const auto& isWanted) -> const LevelLimits* {
        const auto found = std::find_if(_entries.begin(), _entries.end(), [&](const Entry& each) {
            return each.subject.role == Role::None && isWanted(each.subject.path);
        });
        return found == _entries.end() ? nullptr : &found->limits;
    };
    const LevelLimits* const own = find([path](const std::string& each) { return each == path; });
    return own ? own : find([path](const std::string& each) { return fits(each, path); });
}

std::string LevelClasses::add(const Subject& subject, const LevelLimits& limits, const Origin& origin) {
    const auto same = std::find_if(_entries.begin(), _entries.end(),
                                   [&subject](const Entry& each) { return each.subject == subject; });
    if (same == _entries.end()) {
        if (_entries.size() == most)
            return "got more than " + std::to_string(most) + " limits of classes";
        _entries.push_back({subject, limits, origin});
        return {};
    }
    if (same->origin.layer > origin.layer)
        return {};
    if (same->origin.layer == origin.layer) {
        const std::string name = subject.role == Role::None ? subject.path
                                                            : std::string(nameOf(subject.role)) + " in " +
                                                                  std::string(nameOf(subject.technology));
        return "got a second class for " + name + "; the first is at " + same->origin.file + ":" +
               std::to_string(same->origin.line);
    }
    *same = {subject, limits, origin};
    return {};
}

std::size_t LevelClasses::countFrom(std::string_view file) const {
    return static_cast<std::size_t>(std::count_if(
        _entries.begin(), _entries.end(), [file](const Entry& each) { return each.origin.file == file; }));
}

} // namespace velmora
