// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Lists go to another implementation of both forms, Python's plistlib, and come back from it: what Velmora
// writes must mean there what it meant here, and the other way round.

#include "PropertyLists/PropertyList.h"
#include "Tests/PropertyLists/PropertyListSamples.h"
#include "Tests/Support/TemporaryDirectory.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <filesystem>
#include <fstream>
#include <iterator>
#include <string>

namespace velmora {
namespace {

/// `everyKind` of the samples, built and compared in Python; kinds are compared as well as values. Python's
/// dates in lists have no zone and its XML reader takes what the DTD calls an empty key.
constexpr const char* script = R"PY(
import datetime, math, plistlib, sys

def nested(depth):
    value = []
    for _ in range(depth - 1):
        value = [value]
    return value

dt = datetime.datetime
every_kind = {
    "strings": ["", " ", "\n", " \t\n ", " led and trailed ", "two\r\nlines\r", "<&>\"']]>", "&amp;",
                "fourteen chars", "fifteen chars..", "Zellen\u00fcbersicht", "\u20ac", "\U0001F4F6 4/5",
                "\ufffd", "tab\there", "x" * 300, "repeated", "repeated"],
    "integers": [0, 1, -1, 127, 128, 255, 256, 65535, 65536, 4294967295, 4294967296, -4294967296,
                 2**63 - 1, -2**63],
    "reals": [0.0, -0.0, 1.0, -0.1, 1.0 / 3, 1e300, 5e-324, 123456789.125, math.inf, -math.inf,
              sys.float_info.max],
    "booleans": [True, False],
    "dates": [dt(2026, 11, 16, 5), dt(2000, 2, 29), dt(1, 1, 1), dt(9999, 12, 31, 23, 59, 59)],
    "data": [b"", b"\0", b"\1\2", b"\1\2\3", bytes(range(256)) * 3],
    "empty": [[], {}],
    "": "the empty key",
    "<k&y> \u00e9\r": "an awkward key",
    "many": {"key %d" % i: i for i in range(20)},
    "nested": [nested(20), {"a": {"b": 1}}],
}
many_entries = [{"Description": "entry %d" % i, "Code": 0xB000 + i % 512, "Raw": bytes([i % 256]) * 40}
                for i in range(20000)]
samples = {"every": every_kind, "many": many_entries}

def difference(found, wanted, path="root"):
    if type(found) is not type(wanted):
        return "%s: %r is no %s" % (path, found, type(wanted).__name__)
    if isinstance(wanted, dict):
        if list(found) != list(wanted):
            return "%s: keys %r, not %r" % (path, list(found), list(wanted))
        pairs = [(found[k], wanted[k], "%s/%s" % (path, k)) for k in wanted]
    elif isinstance(wanted, list):
        if len(found) != len(wanted):
            return "%s: %d entries, not %d" % (path, len(found), len(wanted))
        pairs = [(f, w, "%s[%d]" % (path, i)) for i, (f, w) in enumerate(zip(found, wanted))]
    else:
        same = repr(found) == repr(wanted)
        return None if same else "%s: %r, not %r" % (path, found, wanted)
    return next((d for d in (difference(*pair) for pair in pairs) if d), None)

action, form, sample, path = sys.argv[1:]
fmt = {"xml": plistlib.FMT_XML, "binary": plistlib.FMT_BINARY}[form]
if action == "write":
    with open(path, "wb") as file:
        plistlib.dump(samples[sample], file, fmt=fmt, sort_keys=False)
else:
    with open(path, "rb") as file:
        found = difference(plistlib.load(file, fmt=fmt), samples[sample])
    if found:
        sys.exit(found)
)PY";

/// The value with every line end a line feed, as plistlib writes text into XML.
std::string withLineFeeds(std::string text) {
    for (std::size_t at = 0; (at = text.find('\r', at)) != std::string::npos;)
        text.replace(at, text.compare(at, 2, "\r\n") == 0 ? 2 : 1, "\n");
    return text;
}

Value withLineFeeds(const Value& value) {
    if (const std::string* text = value.asString())
        return withLineFeeds(*text);
    if (const Array* array = value.asArray()) {
        const auto result = makeArray();
        for (const Value& element : *array)
            result->append(withLineFeeds(element));
        return result;
    }
    if (const Dictionary* dictionary = value.asDictionary()) {
        const auto result = makeDictionary();
        for (const auto& [key, element] : *dictionary)
            result->set(withLineFeeds(key), withLineFeeds(element));
        return result;
    }
    return value;
}

struct Case {
    std::string form;
    std::string sample;
};

class PropertyListExchange : public testing::TestWithParam<Case> {
protected:
    void SetUp() override {
        if (std::system("python3 -c '' >/dev/null 2>&1") != 0)
            GTEST_SKIP() << "there is no python3 to exchange property lists with";
        std::ofstream(_directory / "exchange.py") << script;
    }

    /// Runs the script on the list file; whether it had nothing to complain about.
    [[nodiscard]] testing::AssertionResult python(const std::string& action) const {
        const auto& [form, sample] = GetParam();
        const std::string command = "python3 '" + (_directory / "exchange.py").string() + "' " + action +
                                    " " + form + " " + sample + " '" + list().string() + "' 2>'" +
                                    (_directory / "complaint").string() + "'";
        if (std::system(command.c_str()) == 0)
            return testing::AssertionSuccess();
        std::ifstream complaint(_directory / "complaint");
        return testing::AssertionFailure() << std::string(std::istreambuf_iterator<char>(complaint), {});
    }

    [[nodiscard]] std::filesystem::path list() const { return _directory / "list"; }
    [[nodiscard]] static Value sample() { return GetParam().sample == "every" ? everyKind() : manyEntries(); }

    TemporaryDirectory _directory;
};

TEST_P(PropertyListExchange, WhatIsWrittenHereIsReadThere) {
    std::ofstream file(list(), std::ios::binary);
    if (GetParam().form == "xml") {
        const auto xml = writeXMLPropertyList(sample());
        ASSERT_TRUE(xml) << xml.reason();
        file << *xml;
    } else {
        const auto binary = writeBinaryPropertyList(sample());
        ASSERT_TRUE(binary) << binary.reason();
        file << std::string(binary->begin(), binary->end());
    }
    file.close();
    EXPECT_TRUE(python("check"));
}

TEST_P(PropertyListExchange, WhatIsWrittenThereIsReadHere) {
    ASSERT_TRUE(python("write"));
    std::ifstream file(list(), std::ios::binary);
    const std::vector<std::uint8_t> bytes(std::istreambuf_iterator<char>(file), {});
    const auto value = readPropertyList(bytes, largeLimits);
    ASSERT_TRUE(value) << value.reason();
    const auto& [form, name] = GetParam();
    const Value wanted = form == "xml" ? withLineFeeds(sample()) : sample();
    EXPECT_TRUE(*value == wanted);
    if (name == "every") {
        for (const auto& [key, held] : *wanted.asDictionary())
            EXPECT_TRUE((*value->asDictionary())[key] == held) << key;
    }
}

INSTANTIATE_TEST_SUITE_P(Forms, PropertyListExchange,
                         testing::Values(Case{"xml", "every"}, Case{"binary", "every"}, Case{"xml", "many"},
                                         Case{"binary", "many"}),
                         [](const auto& parameter) {
                             return parameter.param.form + "_" + parameter.param.sample;
                         });

} // namespace
} // namespace velmora
