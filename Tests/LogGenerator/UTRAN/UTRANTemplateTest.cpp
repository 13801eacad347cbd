#include "LogGenerator/UTRAN/UTRANClassIndex.h"
#include "Platform/PropertyList.h"

#include <gmock/gmock.h>

#include <fstream>
#include <iterator>
#include <set>
#include <stdexcept>

namespace velmora {

namespace {

using testing::ElementsAre;

/// The sections whose node is a list of rows; those of all others are dictionaries.
const std::set<std::string, std::less<>> lists = {"Neighbor Cell List", "GSM Neighbor Cell List", "TRCH BLER",
                                                  "CCTRCH SIR", "PDP Context Info"};

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
}

class UTRANTemplate : public testing::Test {
protected:
    UTRANTemplate() {
        std::ifstream file(VELMORA_SOURCE_DIR "/Resources/Ostrel_UTRAN.plist", std::ios::binary);
        const std::vector<std::uint8_t> bytes(std::istreambuf_iterator<char>(file), {});
        const Result<Value> root = readPropertyList(bytes);
        if (!root)
            throw std::runtime_error(root.reason());
        collect(*root, nodes);
    }

    std::vector<Node> nodes;
    UTRANClassIndex index;
};

TEST_F(UTRANTemplate, HoldsEverySectionOnceAndOfItsKind) {
    ASSERT_EQ(index.classDict.size(), 8u);
    for (const auto& [name, section] : index.classDict) {
        SCOPED_TRACE(name);
        int found = 0;
        for (const Node& node : nodes) {
            if (node.key != name)
                continue;
            ++found;
            EXPECT_EQ(nameOf(node.value.kind()), lists.contains(name) ? "array" : "dictionary");
            // Empty, so that nothing is shown that the phone has not reported.
            EXPECT_TRUE(node.value.asArray() ? node.value.asArray()->empty()
                                             : node.value.asDictionary()->empty());
        }
        EXPECT_EQ(found, 1);
    }
}

TEST_F(UTRANTemplate, HoldsNothingElseButTheGroupsAroundThem) {
    std::vector<std::string> others;
    for (const Node& node : nodes) {
        EXPECT_EQ(node.key.find('/'), std::string::npos) << node.key; // keys are path components
        if (index.getClass(node.key))
            continue;
        others.push_back(node.key);
        // A group holds sections; a section under a misspelt name would hold nothing.
        const Dictionary* group = node.value.asDictionary();
        ASSERT_NE(group, nullptr) << node.key;
        EXPECT_FALSE(group->empty()) << node.key;
    }
    EXPECT_THAT(others, ElementsAre("Serving Cell", "Neighbors", "Channel Quality"));
}

} // namespace

} // namespace velmora
