// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/ClassReader.h"

#include "Analysis/Rules/Files/TableReader.h"
#include "Platform/PrintableText.h"

#include <algorithm>
#include <array>
#include <cstddef>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

constexpr std::array<std::string_view, 5> classKeys{"value", "radio-technology", "fair", "good", "excellent"};

std::string inQuotes(std::string_view text) {
    return printableLine(text.substr(0, 64));
}

/// The node itself, or what it has in it if it is an array.
template <typename Use>
void forEach(const TOMLNode& node, const Use& use) {
    if (node.kind == TOMLNode::Kind::Array && !node.items.empty())
        std::for_each(node.items.begin(), node.items.end(), use);
    else
        use(node);
}

std::optional<RadioTechnology> technologyNamed(std::string_view name) {
    for (std::size_t i = 0; i < radioTechnologies; ++i)
        if (nameOf(static_cast<RadioTechnology>(i)) == name)
            return static_cast<RadioTechnology>(i);
    return std::nullopt;
}

bool isLevel(const ExpressionType& type) {
    return type.kind == ExpressionType::Kind::Number && (type.unit == Unit::DBm || type.unit == Unit::DB);
}

std::string got(const TOMLNode& node) {
    return "got " +
           (node.kind == TOMLNode::Kind::Text ? inQuotes(node.text) : std::string(nameOf(node.kind)));
}

} // namespace

std::vector<ClassReader::Class> ClassReader::read(const TOMLNode& document) {
    std::vector<Class> all;
    const TOMLNode* const classes = document.find("class");
    if (!classes)
        return all;
    if (classes->kind != TOMLNode::Kind::Array)
        _errors.add(classes->position, got(*classes) + " for class, wanted [[class]] tables");
    for (const TOMLNode& each : classes->items) {
        if (_errors.isFull())
            break;
        if (each.kind != TOMLNode::Kind::Table)
            _errors.add(each.position, got(each) + ", wanted [[class]] tables");
        else if (std::optional<Class> read = readClass(each))
            all.push_back(std::move(*read));
    }
    return all;
}

std::optional<ClassReader::Class> ClassReader::readClass(const TOMLNode& table) {
    TableReader keys(table, classKeys, _errors);
    Class read;
    read.position = table.position;
    const std::vector<RadioTechnology> technologies = readTechnologies(table);
    if (const TOMLNode* const value = table.find("value"))
        forEach(*value, [&](const TOMLNode& each) { addSubjects(each, table, technologies, read.subjects); });
    else
        _errors.add(table.position, "got no value, wanted serving.level, serving.quality or a path");
    const std::optional<LevelLimits> limits = readLimits(keys);
    if (!limits)
        return std::nullopt;
    read.limits = *limits;
    return read;
}

std::vector<RadioTechnology> ClassReader::readTechnologies(const TOMLNode& table) {
    std::vector<RadioTechnology> technologies;
    const TOMLNode* const node = table.find("radio-technology");
    if (!node)
        return technologies;
    forEach(*node, [&](const TOMLNode& each) {
        const bool isText = each.kind == TOMLNode::Kind::Text;
        if (const auto named = isText ? technologyNamed(each.text) : std::nullopt) {
            technologies.push_back(*named);
            return;
        }
        std::string all;
        for (std::size_t i = 0; i < radioTechnologies; ++i)
            all.append(all.empty() ? "" : ", ").append(nameOf(static_cast<RadioTechnology>(i)));
        _errors.add(each.position, got(each) + ", wanted one or an array of " + all);
    });
    return technologies;
}

void ClassReader::addSubjects(const TOMLNode& value, const TOMLNode& table,
                              const std::vector<RadioTechnology>& technologies,
                              std::vector<LevelClasses::Subject>& subjects) {
    if (value.kind == TOMLNode::Kind::Text && value.text.starts_with('/')) {
        addPath(value, subjects);
        return;
    }
    const std::optional<Role> role =
        value.kind == TOMLNode::Kind::Text ? roleNamed(value.text) : std::nullopt;
    if (role != Role::ServingLevel && role != Role::ServingQuality) {
        _errors.add(value.position, got(value) + ", wanted serving.level, serving.quality or a path");
        return;
    }
    if (!table.find("radio-technology"))
        _errors.add(value.position,
                    "got " + value.text + " without a radio-technology, wanted the ones that it is for");
    for (const RadioTechnology each : technologies)
        subjects.push_back({*role, each});
}

void ClassReader::addPath(const TOMLNode& path, std::vector<LevelClasses::Subject>& subjects) {
    const Result<RuleInput> input = _names.at(path.text);
    if (!input)
        _errors.add(path.position, input.reason());
    else if (!isLevel(input->type))
        _errors.add(path.position, "got '" + inQuotes(path.text) + "', which is " + describe(input->type) +
                                       ", wanted a number in dBm or dB");
    else
        subjects.push_back({.path = path.text});
}

std::optional<LevelLimits> ClassReader::readLimits(TableReader& keys) {
    const TOMLNode* const fair = keys.require("fair", TOMLNode::Kind::Number);
    const TOMLNode* const good = keys.require("good", TOMLNode::Kind::Number);
    const TOMLNode* const excellent = keys.require("excellent", TOMLNode::Kind::Number);
    if (!fair || !good || !excellent)
        return std::nullopt;
    // In this direction, since no NaN is less than anything, and TOML can write one.
    const bool ascends = fair->number < good->number;
    if (!ascends)
        _errors.add(good->position, "got limits that do not ascend, wanted fair below good");
    const bool ascendsFurther = good->number < excellent->number;
    if (!ascendsFurther)
        _errors.add(excellent->position, "got limits that do not ascend, wanted good below excellent");
    return ascends && ascendsFurther
               ? std::optional(LevelLimits{fair->number, good->number, excellent->number})
               : std::nullopt;
}

} // namespace velmora
