// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/FuzzTargets.h"
#include "Fuzz/PropertyLists/SameValue.h"
#include "PropertyLists/PropertyList.h"

#include <string>

namespace velmora {

namespace {

Bytes bytesOf(const std::string& text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

/// What was read is written again in a form that may take more bytes.
constexpr PropertyListLimits rereadLimits{.maximumBytes = std::size_t{4} << 30};

/// The values and keys that show, and the bytes of their texts and data.
struct Extent {
    std::size_t objects = 0;
    std::size_t bytes = 0;

    void add(const Value& value) {
        ++objects;
        if (const std::string* text = value.asString())
            bytes += text->size();
        if (const Data* data = value.asData())
            bytes += data->size();
        if (const Array* array = value.asArray())
            for (const Value& element : *array)
                add(element);
        if (const Dictionary* dictionary = value.asDictionary())
            for (const auto& [key, element] : *dictionary) {
                ++objects;
                bytes += key.size();
                add(element);
            }
    }
};

/// The input is a property list of either form. What was read is written in both forms and read back.
class PropertyListTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        const auto value = readPropertyList(input);
        expectBounded(input, value);
        if (!value) {
            require(!value.reason().empty(), "a list that is refused has a reason");
            return;
        }
        expectWithinMessageLimits(*value);
        const auto binary = writeBinaryPropertyList(*value);
        require(static_cast<bool>(binary), "every list that was read can be written in the binary form");
        const auto again = readPropertyList(*binary);
        require(again && sameValue(*again, *value), "the binary form gives the same value");

        // The XML form has no control characters; then, and only then, it is refused.
        const auto xml = writeXMLPropertyList(*value);
        if (!xml) {
            require(xml.reason().starts_with("a string holds what XML cannot carry"),
                    "only its characters keep a list that was read from the XML form");
            return;
        }
        const auto back = readPropertyList(bytesOf(*xml), rereadLimits);
        require(static_cast<bool>(back), "the XML form can be read");
        const auto xmlAgain = writeXMLPropertyList(*back);
        require(xmlAgain && *xmlAgain == *xml, "the XML form gives the same value");
    }

private:
    /// As often as they show: an object that is referred to twice counts twice.
    static void expectWithinMessageLimits(const Value& value) {
        Extent extent;
        extent.add(value);
        require(extent.objects <= 100'000, "a message makes at most 100,000 values");
        require(extent.bytes <= std::size_t{64} << 20, "a message makes at most 64 MiB");
    }

    /// Narrower limits refuse a list or change nothing.
    static void expectBounded(Bytes input, const Result<Value>& value) {
        constexpr PropertyListLimits narrow{4, 40, 1200, 12'000};
        const auto bounded = readPropertyList(input, narrow);
        if (bounded)
            require(value && sameValue(*bounded, *value), "limits do not change what is read");
    }
};

} // namespace

std::unique_ptr<FuzzTarget> makePropertyListTarget() {
    return std::make_unique<PropertyListTarget>();
}

} // namespace velmora
