// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Classes/LevelClasses.h"
#include "Analysis/Rules/Expression/InputNames.h"
#include "Analysis/Rules/Files/FileErrors.h"
#include "Analysis/Rules/Files/TOMLNode.h"
#include "LogGenerator/Observations/Catalogue.h"

#include <optional>
#include <span>
#include <string>
#include <vector>

namespace velmora {

class TableReader;

/// Reads the limits between classes of levels that a rule file has.
class ClassReader {
public:
    /// What is passed must outlive it.
    ClassReader(std::span<const Catalogue* const> catalogues, FileErrors& errors)
        : _names({catalogues.begin(), catalogues.end()}), _errors(errors) {}

    /// A `[[class]]` table whose limits have no mistake, with those of its values that have none.
    struct Class {
        std::vector<LevelClasses::Subject> subjects;
        LevelLimits limits;
        TextPosition position;
    };
    [[nodiscard]] std::vector<Class> read(const TOMLNode& document);

private:
    [[nodiscard]] std::optional<Class> readClass(const TOMLNode& table);
    [[nodiscard]] std::vector<RadioTechnology> readTechnologies(const TOMLNode& table);
    /// Adds what the value names: a role in each of the technologies, or a path.
    void addSubjects(const TOMLNode& value, const TOMLNode& table,
                     const std::vector<RadioTechnology>& technologies,
                     std::vector<LevelClasses::Subject>& subjects);
    void addPath(const TOMLNode& path, std::vector<LevelClasses::Subject>& subjects);
    [[nodiscard]] std::optional<LevelLimits> readLimits(TableReader& keys);

    const InputNames _names;
    FileErrors& _errors;
};

} // namespace velmora
