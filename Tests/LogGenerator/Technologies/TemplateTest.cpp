// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "Tests/LogGenerator/Technologies/Technologies.h"
#include "Tests/Support/ShippedResources.h"

#include <gmock/gmock.h>

#include <stdexcept>

namespace velmora {
namespace {

using testing::ElementsAreArray;

/// A key of a template with its value.
struct TemplateNode {
    std::string key;
    Value value;
};

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

/// Every key of that template, at whatever depth.
std::vector<TemplateNode> shippedTemplate(const std::string& name) {
    const Result<Value> root = readPropertyList(shippedResource(name + ".plist").bytes());
    if (!root)
        throw std::runtime_error(root.reason());
    std::vector<TemplateNode> nodes;
    collect(*root, nodes);
    return nodes;
}

/// The template that is shipped for a technology's sections.
class TemplateTest : public testing::TestWithParam<Technology> {
protected:
    const Technology& technology = GetParam();
    const std::vector<TemplateNode> nodes = shippedTemplate(technology.templateName);
    const std::unique_ptr<ClassIndex> index = technology.makeIndex();
};

// An empty array for a list, an empty dictionary for any other section, so that nothing is shown that the
// phone has not reported.
TEST_P(TemplateTest, HoldsEverySectionOnceAndOfItsKind) {
    ASSERT_EQ(index->classDict.size(), technology.sections.size());
    for (const auto& [name, section] : index->classDict) {
        int found = 0;
        for (const TemplateNode& node : nodes) {
            if (node.key != name)
                continue;
            ++found;
            const bool list = technology.lists.contains(name);
            EXPECT_EQ(nameOf(node.value.kind()), list ? "array" : "dictionary") << name;
            EXPECT_TRUE(isEmpty(node.value)) << name << " holds something";
        }
        EXPECT_EQ(found, 1) << "times that the template holds " << name;
    }
    for (const std::string& list : technology.lists)
        EXPECT_NE(index->getClass(list), nullptr) << list << " is no section";
}

// A group holds something: a section under a misspelt name would hold nothing.
TEST_P(TemplateTest, HoldsNothingElseButTheGroupsAroundThem) {
    std::vector<std::string> others;
    for (const TemplateNode& node : nodes) {
        if (index->getClass(node.key))
            continue;
        others.push_back(node.key);
        const Dictionary* group = node.value.asDictionary();
        ASSERT_NE(group, nullptr) << node.key << " is neither a section nor a group";
        EXPECT_FALSE(group->empty()) << node.key << " is no section and holds none";
    }
    EXPECT_THAT(others, ElementsAreArray(technology.groups));
}

INSTANTIATE_TEST_SUITE_P(All, TemplateTest, testing::ValuesIn(technologies()), testName);

class TemplateKeysTest : public testing::TestWithParam<const char*> {};

TEST_P(TemplateKeysTest, ArePathComponents) {
    for (const TemplateNode& node : shippedTemplate(GetParam())) {
        EXPECT_FALSE(node.key.empty());
        EXPECT_EQ(node.key.find('/'), std::string::npos) << node.key;
    }
}

INSTANTIATE_TEST_SUITE_P(All, TemplateKeysTest,
                         testing::Values("LTE", "Modem", "Ostrel_GSM", "Ostrel_UTRAN", "C2KTemplate"),
                         [](const auto& name) { return std::string(name.param); });

} // namespace
} // namespace velmora
