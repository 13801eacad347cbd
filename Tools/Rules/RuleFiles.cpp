// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Rules/RuleFiles.h"

#include "Platform/Linux/Files/FileResources.h"
#include "Platform/Linux/Files/Files.h"
#include "Platform/Linux/Files/FolderFiles.h"
#include "Platform/TelephonyService.h"

#include <algorithm>
#include <filesystem>
#include <limits>
#include <utility>

namespace velmora {

namespace {

constexpr int layerOfGivenFiles = std::numeric_limits<int>::max();

void addFile(const RulePath& file, RuleSet& rules) {
    const Result<Data> content = readFile(file.path, RuleSet::mostBytes);
    if (!content) {
        rules.addError({file.path, 0, 0, content.reason()});
        return;
    }
    const Bytes bytes = content->bytes();
    rules.add({file.path, std::string(bytes.begin(), bytes.end()), file.layer, file.isBuiltIn});
}

/// Whether the file is in one of the directories of the user's own.
bool isUsers(const std::filesystem::path& file) {
    const std::vector<std::filesystem::path> own = FileResources::ownDirectories();
    return std::find(own.begin(), own.end(), file.parent_path().parent_path()) != own.end();
}

} // namespace

AllCatalogues::AllCatalogues() {
    for (const std::string_view technology : voxTechnologies)
        if (auto decoder = LogGenerator::generatorFromTechnology(technology, _clock)) {
            _catalogues.push_back(&decoder->catalogue());
            _decoders.push_back(std::move(decoder));
        }
}

std::vector<RulePath> standardRulePaths() {
    std::vector<RulePath> paths;
    for (const FolderFile& each : filesInFolder(FileResources::standardDirectories(), "rules", "toml"))
        paths.push_back({each.path.string(), each.layer, !isUsers(each.path)});
    return paths;
}

std::vector<RulePath> rulePaths(std::span<const std::string> files) {
    std::vector<RulePath> paths;
    for (const std::string& file : files)
        paths.push_back({file, layerOfGivenFiles, false});
    return paths;
}

RuleSet readRules(const AllCatalogues& catalogues, std::span<const RulePath> paths) {
    RuleSet rules(catalogues.all());
    for (const RulePath& each : paths)
        addFile(each, rules);
    return rules;
}

RuleSet loadOnlyRules(const AllCatalogues& catalogues, std::span<const std::string> files) {
    return readRules(catalogues, rulePaths(files));
}

RuleSet loadBuiltInRules(const AllCatalogues& catalogues) {
    std::vector<RulePath> paths = standardRulePaths();
    std::erase_if(paths, [](const RulePath& each) { return !each.isBuiltIn; });
    return readRules(catalogues, paths);
}

RuleSet loadRules(const AllCatalogues& catalogues, std::span<const std::string> files) {
    std::vector<RulePath> paths = standardRulePaths();
    for (RulePath& each : rulePaths(files))
        paths.push_back(std::move(each));
    return readRules(catalogues, paths);
}

} // namespace velmora
