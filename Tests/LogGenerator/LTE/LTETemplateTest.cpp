#include "LogGenerator/LTE/LTEClassIndex.h"
#include "Platform/PropertyList.h"

#include <gmock/gmock.h>

#include <fstream>
#include <iterator>
#include <set>

namespace velmora {

namespace {

using testing::ElementsAre;

/// The sections whose node is a list of rows; those of all others are dictionaries.
const std::set<std::string, std::less<>> lists = {"Measured Neighbor Cells", "Detected Cells",
                                                  "Neighbor Cells List", "Reselection Candidates List",
                                                  "PDP Context Info"};

struct Node {
    std::string key;
    Value value;
};

/// Every key of the template with its value, at whatever depth.
void collect(const Value& value, std::vector<Node>& nodes) {
    if (const Dictionary* dictionary = value.asDictionary())
        for (const auto& [key, entry] : *dictionary) {
            nodes.push_back({key, entry});
            collect(entry, nodes);
        }
    if (const Array* array = value.asArray())
        for (const Value& element : *array)
            collect(element, nodes);
}

class LTETemplate : public testing::Test {
protected:
    LTETemplate() {
        std::ifstream file(VELMORA_SOURCE_DIR "/Resources/LTE.plist", std::ios::binary);
        const std::vector<std::uint8_t> bytes(std::istreambuf_iterator<char>(file), {});
        const Result<Value> read = readPropertyList(bytes);
        if (!read)
            throw std::runtime_error(read.reason());
        root = *read;
        collect(root, nodes);
    }

    Value root;
    std::vector<Node> nodes;
    LTEClassIndex index;
};

TEST_F(LTETemplate, HoldsEverySectionOnceAndOfItsKind) {
    ASSERT_EQ(index.classDict.size(), 11u);
    for (const auto& [name, section] : index.classDict) {
        SCOPED_TRACE(name);
        int found = 0;
        for (const Node& node : nodes)
            if (node.key == name) {
                ++found;
                EXPECT_EQ(nameOf(node.value.kind()), lists.contains(name) ? "array" : "dictionary");
                // Empty, so that nothing is shown that the phone has not reported.
                if (const Dictionary* dictionary = node.value.asDictionary()) {
                    EXPECT_TRUE(dictionary->empty());
                }
                if (const Array* array = node.value.asArray()) {
                    EXPECT_TRUE(array->empty());
                }
            }
        EXPECT_EQ(found, 1);
    }
}

TEST_F(LTETemplate, HoldsNothingElseButTheGroupsAroundThem) {
    std::vector<std::string> others;
    for (const Node& node : nodes)
        if (!index.getClass(node.key)) {
            others.push_back(node.key);
            // A group holds sections; a section under a misspelt name would hold nothing.
            const Dictionary* group = node.value.asDictionary();
            ASSERT_NE(group, nullptr) << node.key;
            EXPECT_FALSE(group->empty()) << node.key;
        }
    EXPECT_THAT(others, ElementsAre("Serving Cell", "Idle Mode Neighbors", "Reselection", "Connected Mode",
                                    "Packet Data"));
}

TEST_F(LTETemplate, KeysArePathComponents) {
    for (const Node& node : nodes)
        EXPECT_EQ(node.key.find('/'), std::string::npos) << node.key;
}

} // namespace

} // namespace velmora
