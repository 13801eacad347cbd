// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Columns/ColumnNames.h"

#include <gtest/gtest.h>

#include <sstream>

namespace velmora {
namespace {

TEST(ColumnName, isInLowerCaseWithOneUnderscoreForAllElse) {
    EXPECT_EQ(columnName("Measured RSRP"), "measured_rsrp");
    EXPECT_EQ(columnName("EV-DO State"), "ev_do_state");
    EXPECT_EQ(columnName("gNB ID (if of 24 bits)"), "gnb_id_if_of_24_bits");
    EXPECT_EQ(columnName("1x"), "1x");
    EXPECT_EQ(columnName(" \u00e4b "), "b");
    EXPECT_EQ(columnName("-"), "");
}

/// The place of a leaf at the path.
ColumnPlace place(const std::string& path, const std::string& section,
                  ObservedKind kind = ObservedKind::Number, Unit unit = Unit::None) {
    Catalogue catalogue("T");
    Catalogue::Node* node = &catalogue.root();
    std::istringstream labels(path.substr(1));
    for (std::string label; std::getline(labels, label, '/');)
        node = &node->child(label);
    CatalogueField& leaf = catalogue.leafAt(*node, section);
    leaf.kind = kind;
    leaf.unit = unit;
    return placeOf(leaf);
}

TEST(ColumnPlace, isInTheSectionsTable) {
    EXPECT_EQ(place("/Registration/Serving PLMN/Service Type", "Serving PLMN"),
              (ColumnPlace{"registration_serving_plmn", "service_type", 0}));
    EXPECT_EQ(place("/SIM Info/EF-GPRS/PS-LOCI", "SIM Info"),
              (ColumnPlace{"sim_info", "ef_gprs_ps_loci", 0}));
}

TEST(ColumnPlace, isInTheTableOfWhatIsAtTheTopWithoutASection) {
    EXPECT_EQ(place("/1x/Second Receiver/Channel", ""), (ColumnPlace{"1x", "second_receiver_channel", 0}));
}

TEST(ColumnPlace, isInTheListsTable) {
    EXPECT_EQ(place("/GSM/Neighboring Cells/*/RSSI", "Neighboring Cells", ObservedKind::Number, Unit::DBm),
              (ColumnPlace{"gsm_neighboring_cells", "rssi_dbm", 1}));
    EXPECT_EQ(place("/A/B/*/SIR/*", "B", ObservedKind::Number, Unit::DB),
              (ColumnPlace{"a_b_sir", "sir_db", 2}));
}

TEST(ColumnPlace, hasTheLastLabelWhereNoneIsLeft) {
    EXPECT_EQ(place("/Registration", "", ObservedKind::Text),
              (ColumnPlace{"registration", "registration_text", 0}));
    EXPECT_EQ(place("/GSM/ARFCNs/*", ""), (ColumnPlace{"gsm_arfcns", "arfcns", 1}));
}

TEST(ColumnPlace, endsWithWhatItHolds) {
    const auto column = [](ObservedKind kind, Unit unit = Unit::None) {
        return place("/S/X", "S", kind, unit).column;
    };
    EXPECT_EQ(column(ObservedKind::Number), "x");
    EXPECT_EQ(column(ObservedKind::Number, Unit::DB), "x_db");
    EXPECT_EQ(column(ObservedKind::Number, Unit::Percent), "x_percent");
    EXPECT_EQ(column(ObservedKind::Number, Unit::KilobitPerSecond), "x_kbit_s");
    EXPECT_EQ(column(ObservedKind::Number, Unit::Second), "x_s");
    EXPECT_EQ(column(ObservedKind::Number, Unit::Megahertz), "x_mhz");
    EXPECT_EQ(column(ObservedKind::Number, Unit::Byte), "x_byte");
    EXPECT_EQ(column(ObservedKind::Number, Unit::Degree), "x_degree");
    EXPECT_EQ(column(ObservedKind::Number, Unit::Metre), "x_m");
    EXPECT_EQ(column(ObservedKind::Text), "x_text");
    EXPECT_EQ(column(ObservedKind::Flag), "x_flag");
    EXPECT_EQ(column(ObservedKind::Binary), "x_data");
    EXPECT_EQ(column(ObservedKind::Enumeration), "x");
}

} // namespace
} // namespace velmora
