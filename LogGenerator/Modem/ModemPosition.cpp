// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemPosition.h"

#include "LogGenerator/Modem/ModemStatus.h"
#include "LogGenerator/Modem/Values/ValueRow.h"
#include "LogMessages/LiveModem.h"

namespace velmora {

using namespace LiveModem;

namespace {

constexpr View positionViews[] = {{LiveModemCode::position, std::size_t{0}}};

constexpr Meaning location{.identity = Identity::Location};
/// The receiver's "hhmmss" and fraction, as in NMEA sentences, with colons; another form as it stands.
std::optional<std::string> clockText(const Value& value) {
    std::optional<std::string> text = textOf(value);
    if (text && text->find_first_not_of("0123456789") >= 6 &&
        (text->size() == 6 || (text->size() > 6 && (*text)[6] == '.')))
        text->insert(4, 1, ':').insert(2, 1, ':');
    return text;
}

constexpr ValueRow positionRows[] = {
    {kVoxPositionLatitude, {"Latitude", computed, real("%.6f\u00B0"), location}, {-90, 90}},
    {kVoxPositionLongitude, {"Longitude", computed, real("%.6f\u00B0"), location}, {-180, 180}},
    {kVoxPositionAltitude, {"Altitude", computed, real("%.1f m"), location}, {-1000, 100'000}},
    {kVoxPositionTime, {"Time (UTC)", computed, plainText()}, {}, 1, clockText},
};

} // namespace

std::span<const View> ModemPosition::views() const {
    return positionViews;
}

std::string ModemPosition::stateOf(const Dictionary& message) const {
    const bool isKnown = numberOf(message[kVoxPositionLatitude], positionRows[0].range) &&
                         numberOf(message[kVoxPositionLongitude], positionRows[1].range);
    return isKnown ? workingState(message) : "No position";
}

void ModemPosition::show(const Dictionary& message, FieldVisitor& visitor) const {
    visitValues(message, positionRows, visitor);
}

void ModemPosition::describeShown(ContentVisitor& visitor) const {
    describeValues(positionRows, visitor);
}

} // namespace velmora
