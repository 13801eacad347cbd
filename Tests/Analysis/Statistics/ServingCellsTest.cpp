// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Statistics/ServingCells.h"

#include "Analysis/Picture/RadioPicture.h"
#include "Tests/LogGenerator/Observations/DecodedTechnology.h"

#include <gtest/gtest.h>

#include <chrono>
#include <cstdint>
#include <stdexcept>
#include <string_view>
#include <vector>

namespace velmora {
namespace {

/// A picture of what a test's messages report: values by role, of GSM and UMTS.
class ServingCellsTest : public testing::Test {
protected:
    struct Value {
        const char* path;
        double number;
    };

    std::uint32_t report(const std::vector<Value>& values) {
        std::vector<Observation> observations;
        for (const Value& value : values) {
            Observation& each = observations.emplace_back();
            each.leaf = &leaf(value.path);
            each.kind = ObservedKind::Number;
            each.number = value.number;
        }
        ++_number;
        const Time time{std::chrono::milliseconds(100 * _number)};
        const ObservedMessage observed{_number, time, {}, {}, observations, {}, {}};
        picture.update({{0, _number}, time, observed});
        return cells.numberOf(picture);
    }

    TechnologyUnderTest technology{decodedTechnologies[0]};
    RadioPicture picture{technology.decoder().catalogue()};
    ServingCells cells;

private:
    [[nodiscard]] const CatalogueField& leaf(std::string_view path) {
        for (const CatalogueField& each : technology.decoder().catalogue().fields())
            if (each.path == path)
                return each;
        throw std::logic_error("no such leaf");
    }

    std::uint64_t _number = 0;
};

constexpr const char* arfcn = "/GSM/GSM Serving Cell/ARFCN";
constexpr const char* bsic = "/GSM/GSM Serving Cell/BSIC";
constexpr const char* cellID = "/GSM/GSM Serving Cell/Cell ID";
constexpr const char* level = "/GSM/GSM Serving Cell/RSSI";

TEST_F(ServingCellsTest, AreNumberedAsTheyComeAndRecognised) {
    EXPECT_EQ(report({{level, -80}}), ServingCells::unknown);
    EXPECT_EQ(report({{arfcn, 18}, {bsic, 36}}), 1u);
    EXPECT_EQ(report({{level, -80}}), 1u);
    EXPECT_EQ(report({{arfcn, 32}, {bsic, 57}}), 2u);
    EXPECT_EQ(report({{arfcn, 18}, {bsic, 36}}), 1u);
    EXPECT_EQ(nameOf(cells.identity(2)), "BSIC 57 on ARFCN 32");
}

TEST_F(ServingCellsTest, AreOneCellWhateverIsKnownOfIt) {
    EXPECT_EQ(report({{arfcn, 18}, {cellID, 10181}}), 1u);
    EXPECT_EQ(nameOf(cells.identity(1)), "cell 10181 on ARFCN 18");
    EXPECT_EQ(report({{bsic, 36}}), 1u);
    EXPECT_EQ(nameOf(cells.identity(1)), "BSIC 36 on ARFCN 18");
    EXPECT_EQ(report({{arfcn, 32}, {cellID, 10191}}), 2u);
    // Back, first by its cell identity, or by its BSIC.
    EXPECT_EQ(report({{arfcn, 18}, {cellID, 10181}}), 1u);
    EXPECT_EQ(report({{arfcn, 32}, {cellID, 10191}}), 2u);
    EXPECT_EQ(report({{arfcn, 18}, {bsic, 36}}), 1u);
}

} // namespace
} // namespace velmora
