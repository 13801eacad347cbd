// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/TemplateCheck.h"

#include "PropertyLists/PropertyList.h"
#include "Tests/Support/ShippedResources.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <stdexcept>

namespace velmora {

namespace {

void collect(const Value& value, std::vector<TemplateNode>& nodes) {
    if (const Dictionary* dictionary = value.asDictionary())
        for (const auto& [key, entry] : *dictionary) {
            nodes.push_back({key, entry});
            collect(entry, nodes);
        }
    if (const Array* array = value.asArray())
        for (const Value& element : *array)
            collect(element, nodes);
}

bool isEmpty(const Value& value) {
    if (const Array* array = value.asArray())
        return array->empty();
    const Dictionary* dictionary = value.asDictionary();
    return dictionary && dictionary->empty();
}

} // namespace

std::vector<TemplateNode> shippedTemplate(std::string_view fileName) {
    const Result<Value> root = readPropertyList(shippedResource(fileName).bytes());
    if (!root)
        throw std::runtime_error(root.reason());
    std::vector<TemplateNode> nodes;
    collect(*root, nodes);
    return nodes;
}

void expectEverySectionOnce(const std::vector<TemplateNode>& nodes, const ClassIndex& index,
                            const std::set<std::string, std::less<>>& lists) {
    for (const auto& [name, section] : index.classDict) {
        int found = 0;
        for (const TemplateNode& node : nodes) {
            if (node.key != name)
                continue;
            ++found;
            EXPECT_EQ(nameOf(node.value.kind()), lists.contains(name) ? "array" : "dictionary") << name;
            EXPECT_TRUE(isEmpty(node.value)) << name << " holds something";
        }
        EXPECT_EQ(found, 1) << "times that the template holds " << name;
    }
    for (const std::string& list : lists)
        EXPECT_NE(index.getClass(list), nullptr) << list << " is no section";
}

void expectGroups(const std::vector<TemplateNode>& nodes, const ClassIndex& index,
                  const std::vector<std::string>& groups) {
    std::vector<std::string> others;
    for (const TemplateNode& node : nodes) {
        if (index.getClass(node.key))
            continue;
        others.push_back(node.key);
        const Dictionary* group = node.value.asDictionary();
        ASSERT_NE(group, nullptr) << node.key << " is neither a section nor a group";
        EXPECT_FALSE(group->empty()) << node.key << " is no section and holds none";
    }
    EXPECT_THAT(others, ::testing::ElementsAreArray(groups));
}

void expectPathComponents(const std::vector<TemplateNode>& nodes) {
    for (const TemplateNode& node : nodes)
        EXPECT_EQ(node.key.find('/'), std::string::npos) << node.key;
}

} // namespace velmora
