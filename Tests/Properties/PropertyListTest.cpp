// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Properties/GivenValues.h"

#include <gtest/gtest.h>

#include <rapidcheck/gtest.h>

// Both forms of a property list represent every value that they accept.

namespace velmora {
namespace {

Bytes bytesOfText(const std::string& text) {
    return {reinterpret_cast<const std::uint8_t*>(text.data()), text.size()};
}

RC_GTEST_PROP(PropertyLists, AreReadFromXMLAsTheyWereWritten, ()) {
    const Value value = *givenValue();
    const auto text = writeXMLPropertyList(value);
    RC_ASSERT(bool(text));
    const auto read = readPropertyList(bytesOfText(*text));
    RC_ASSERT(bool(read));
    RC_ASSERT(*read == value);
}

RC_GTEST_PROP(PropertyLists, AreReadFromTheBinaryFormAsTheyWereWritten, ()) {
    const Value value = *givenValue();
    const auto bytes = writeBinaryPropertyList(value);
    RC_ASSERT(bool(bytes));
    const auto read = readPropertyList(*bytes);
    RC_ASSERT(bool(read));
    RC_ASSERT(*read == value);
}

RC_GTEST_PROP(PropertyLists, AreWrittenTheSameAfterEitherForm, ()) {
    const Value value = *givenValue();
    const auto fromXML = readPropertyList(bytesOfText(*writeXMLPropertyList(value)));
    const auto fromBinary = readPropertyList(*writeBinaryPropertyList(value));
    RC_ASSERT(*writeXMLPropertyList(*fromBinary) == *writeXMLPropertyList(value));
    RC_ASSERT(*writeBinaryPropertyList(*fromXML) == *writeBinaryPropertyList(value));
}

RC_GTEST_PROP(PropertyLists, OfAnyBytesAreAValueThatCanBeWrittenOrAReason, ()) {
    auto bytes =
        *rc::gen::map(givenValue(), [](const Value& value) { return *writeBinaryPropertyList(value); });
    const auto changes =
        *rc::gen::arbitrary<std::vector<std::pair<std::uint16_t, std::uint8_t>>>().as("changed bytes");
    for (const auto& [at, byte] : changes)
        bytes[at % bytes.size()] = byte;
    const auto read = readPropertyList(bytes);
    if (!read) {
        RC_ASSERT(!read.reason().empty());
        return;
    }
    const auto again = writeBinaryPropertyList(*read);
    RC_ASSERT(bool(again));
    const auto readAgain = readPropertyList(*again);
    RC_ASSERT(bool(readAgain));
    RC_ASSERT(*writeBinaryPropertyList(*readAgain) == *again);
}

} // namespace
} // namespace velmora
