// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/LogGenerator/Observations/Truth/TruthTest.h"

#include <algorithm>
#include <cmath>

namespace velmora {

TruthTest::TruthTest(const DecodedTechnology& technology) : _tested(technology) {
    _tested.decoder().setObservationSink(this);
}

TruthTest::~TruthTest() {
    _tested.decoder().setObservationSink(nullptr);
}

void TruthTest::decode(const Data& message) {
    _seen.clear();
    _tested.decoder().updateState(_tested.state, message);
}

void TruthTest::observed(const ObservedMessage& message) {
    for (const Observation& each : message.observations) {
        if (each.leaf->role == Role::None || each.kind == ObservedKind::Absent)
            continue;
        Seen value{each.leaf->role, {}, {}, each.kind, each.number, each.raw, std::string(each.words)};
        each.appendPath(value.path);
        if (!each.rows.empty())
            value.row = value.path.substr(0, value.path.rfind('/'));
        _seen.push_back(std::move(value));
    }
}

std::vector<TruthTest::Row> TruthTest::rowsWith(Role role) const {
    std::map<std::string, Row> rows;
    for (const Seen& each : _seen)
        if (!each.row.empty())
            rows[each.row].insert_or_assign(each.role, each);
    std::vector<Row> found;
    for (const auto& [path, row] : rows)
        if (row.contains(role))
            found.push_back(row);
    return found;
}

void TruthTest::expectNumber(const Seen& value, double meant, double tolerance) {
    expectAmong(value, {meant}, tolerance);
}

void TruthTest::expectAmong(const Seen& value, const std::vector<double>& meant, double tolerance) {
    ++_compared[value.role];
    const bool isAmong = std::any_of(
        meant.begin(), meant.end(), [&](double each) { return std::fabs(value.number - each) <= tolerance; });
    if (value.kind != ObservedKind::Number || !isAmong)
        ADD_FAILURE() << value.path << " is " << value.number << ", the drive meant "
                      << testing::PrintToString(meant);
}

void TruthTest::expectRaw(const Seen& value, std::int64_t meant) {
    ++_compared[value.role];
    EXPECT_EQ(value.kind, ObservedKind::Enumeration) << value.path;
    EXPECT_EQ(value.raw, meant) << value.path;
}

void TruthTest::expectWords(const Seen& value, const std::string& meant) {
    ++_compared[value.role];
    EXPECT_EQ(value.kind, ObservedKind::Text) << value.path;
    EXPECT_EQ(value.words, meant) << value.path;
}

void TruthTest::expectCompared(std::initializer_list<Role> roles) const {
    for (const Role role : roles) {
        const auto found = _compared.find(role);
        EXPECT_GT(found == _compared.end() ? 0 : found->second, 20) << nameOf(role);
    }
}

std::string TruthTest::digits(int number, std::size_t width) {
    std::string text = std::to_string(number);
    text.insert(0, width - std::min(width, text.size()), '0');
    return text;
}

} // namespace velmora
