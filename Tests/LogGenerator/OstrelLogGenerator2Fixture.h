// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelLogGenerator2.h"
#include "Tests/Support/CapturedLog.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <initializer_list>
#include <memory>
#include <span>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// A section that notes what it is given, and shows the record's length.
class Listener : public Base {
public:
    struct Call {
        Data data;
        std::uint32_t code;
    };

    Listener(std::string name, const std::vector<std::uint32_t>& codes) : _name(std::move(name)) {
        for (const std::uint32_t code : codes)
            _views.emplace_back(code, std::size_t{0});
    }
    [[nodiscard]] std::string_view getSectionName() const override { return _name; }
    [[nodiscard]] std::span<const View> views() const override { return _views; }
    void updateWithData(const Data& data, std::uint32_t code) override {
        calls.push_back({data, code});
        Base::updateWithData(data, code);
    }
    void decode(const View&, const Record& record, FieldVisitor& visitor) const override {
        static constexpr Field length{"Length", computed, integer("%d")};
        visitor.number(length, static_cast<std::int64_t>(record.size()));
    }

    std::vector<Call> calls;

private:
    void trace() const override {}

    std::string _name;
    std::vector<View> _views;
};

class ListenerIndex final : public ClassIndex {
public:
    ListenerIndex() {
        for (Listener* section : {&baseband, &extra, &list})
            section->initWithDict(classDict, codeDictionary);
    }
    Listener baseband{"RRC Info", {0xD0E0, 0x1234}};
    Listener extra{"SIM Info", {0xFF0000, 0xFF0002}};
    Listener list{"Rows", {0x1234}};
};

/// A decoder of three sections whose template is "Probe".
class OstrelLogGenerator2Fixture : public testing::Test {
protected:
    OstrelLogGenerator2Fixture() {
        resources.put("Probe", "plist",
                      Value(std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
                          {"Maker", "none"},
                          {"Radio", std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
                                        {"RRC Info", makeDictionary()}, {"Rows", makeArray()}})},
                          {"SIM Info", std::make_shared<Dictionary>(std::initializer_list<Dictionary::Entry>{
                                           {"Length", "not yet"}})}})));
    }

    void update(const Data& message) { generator.updateState(state, message); }
    [[nodiscard]] Data raw() { // what the next refresh hands over
        static_cast<void>(generator.generateLogUsingState(state));
        return *state["DisplayState"].asData();
    }
    [[nodiscard]] const Dictionary& display() { return *generator.display(state).asDictionary(); }

    CapturedLog log;
    FakeClock clock;
    FakeResources resources;
    std::shared_ptr<ListenerIndex> index = std::make_shared<ListenerIndex>();
    OstrelLogGenerator2 generator{"Probe", index, clock};
    Dictionary state;
};

} // namespace velmora
