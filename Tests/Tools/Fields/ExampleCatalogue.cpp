// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/Fields/ExampleCatalogue.h"

#include "Tests/Support/TemporaryDirectory.h"
#include "Tools/Output.h"

#include <fstream>
#include <iterator>

#include <fcntl.h>
#include <unistd.h>

namespace velmora {

namespace {

constexpr EnumText stateRows[] = {{1, "Idle"}, {7, "Busy, \"really\""}};
constexpr EnumTexts states(stateRows, "[Reserved ", "]");
constexpr EnumText modeRows[] = {{0, "Automatic"}};
constexpr EnumTexts modes(modeRows, "Unknown");

constexpr std::string_view cellKeys[] = {"ARFCN", "BSIC"};
constexpr List cells{.label = "Cells"};

constexpr Field level{
    "Level", u8At(2), integer("%d"), {.role = Role::NeighbourLevel, .unit = Unit::DBm, .scale = negated}};
constexpr Field serviceLevel{
    "Level", computed, unless(-999, "", integer("%d dBm", 5, 2)), {.role = Role::NeighbourLevel}};
constexpr Field state{
    "State", u8At(14), text(states), {.role = Role::RadioState, .clause = "3GPP TS 24.008 4.1"}};
constexpr Field mode{"Mode", u32At(46), text(modes), {.isAbsence = true}};
constexpr Field barred{"Barred", bitsAt(25, 3, 1), flag("Barred", "Allowed")};
constexpr Field network{"Network",
                        u16BigEndianAt(20),
                        integer("%d"),
                        {.role = Role::ServingNetworkCode,
                         .digits = 2,
                         .identity = Identity::Location,
                         .absent = "N/A",
                         .clause = "3GPP TS 23.003 2.2"}};
constexpr Field power{"Power", bitsAt(21, 0, 9), real("%4.2f dBm", 0.25, -140), {.sign = Sign::Signed}};
constexpr Field rate{"Rate", u32At(30), integer("%d kbps")};
constexpr Field gain{"AGC", u16At(10), integer("%u")};
constexpr Field name{"Name", computed, plainText(), {.identity = Identity::Subscriber}};
constexpr Field textLevel{"", computed, integer("%d dBm"), {.role = Role::ServingLevel}};

CatalogueRows rowsOf(const Catalogue& catalogue) {
    return {catalogue.fields().begin(), catalogue.fields().end()};
}

} // namespace

ExampleCatalogue::ExampleCatalogue() {
    Catalogue::Node& group = _catalogue.root().child("Group");
    Catalogue::Node& row = group.child("Cells").rows();
    row.setKeys(cellKeys);
    Catalogue::Node& levels = row.child("Level");
    _catalogue.add(levels, "Cells", {0x5137, &level, &cells});
    _catalogue.add(levels, "Cells", {0xFF0001, &serviceLevel, nullptr});
    _catalogue.add(group.child("State"), "Status", {0x512C, &state});
    _catalogue.add(group.child("State"), "Status", {0x512C, &mode});
    _catalogue.add(group.child("Barred"), "Status", {0x512C, &barred});
    _catalogue.add(group.child("Network"), "Status", {0x7135, &network});
    _catalogue.add(group.child("Power"), "Status", {0xB17F, &power});
    CatalogueField& again = _catalogue.add(_catalogue.root().child("Rate"), "Status", {0xB17F, &rate});
    again.sameAs = "/Group/Power";
    _catalogue.add(_catalogue.root().child("Name"), "SIM Info", {0xFF0000, &name});
    _catalogue.add(_catalogue.root().child("AGC"), "", {0x119C, &gain, nullptr, 2});
    CatalogueField& empty = _catalogue.leafAt(_catalogue.root().child("List"), "");
    empty.kind = ObservedKind::Absent;
    empty.absentTexts = {"", "(none)"};
}

CatalogueRows ExampleCatalogue::rows() const {
    return rowsOf(_catalogue);
}

ExampleTexts::ExampleTexts() {
    _catalogue.add(_catalogue.root().child("RxLev"), "", {0, &textLevel}).isReadFromText = true;
    _catalogue.add(_catalogue.root().child("Na\u00EFve\n"), "", {0, &name});
}

CatalogueRows ExampleTexts::rows() const {
    return rowsOf(_catalogue);
}

std::string written(const std::function<void(Output&)>& write) {
    const TemporaryDirectory directory;
    const std::string path = directory / "output";
    const int file = ::open(path.c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600);
    {
        Output output(file);
        write(output);
    }
    ::close(file);
    std::ifstream text(path, std::ios::binary);
    return {std::istreambuf_iterator<char>(text), {}};
}

} // namespace velmora
