// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <cstdint>
#include <span>
#include <string_view>

namespace velmora {

/// The interface or dictionary of a member of ModemManager's.
enum class MemberOf : std::uint8_t {
    AnyCell,  ///< a cell of GetCellInfo, of any type
    CDMACell, ///< one of type CDMA, and so on
    GSMCell,
    UMTSCell,
    TDSCDMACell,
    LTECell,
    NRCell,
    CSLocation,  ///< a part of GetLocation's text "MCC,MNC,LAC,CI,TAC", while registered on GSM or UMTS
    EPSLocation, ///< the same while registered on LTE
    NRLocation,  ///< the same while registered on NR alone
    Satellites,  ///< GetLocation's dictionary of a satellite receiver
    Sentences,   ///< GetLocation's NMEA sentences; each kind is a member
    GSMSignal,   ///< the dictionary Modem.Signal.Gsm, and so on
    UMTSSignal,
    LTESignal,
    NRSignal,
    CDMASignal,
    EVDOSignal,
    Modem, ///< the interface Modem, and so on
    Modem3gpp,
    ModemCdma,
    Location,
    Signal, ///< but for its dictionaries
    SIM,
    Bearer,
    BearerProperties, ///< the dictionary Bearer.Properties, and so on
    IPv4,             ///< Ip4Config
    IPv6,             ///< Ip6Config
    Statistics,       ///< Stats
    Manager,          ///< ModemManager's own interface
    OtherInterface,   ///< of a modem; each interface is a member
};

/// What a member is used for: where the key that it sets lies.
enum class MemberUse : std::uint8_t {
    State,        ///< every message
    Cell,         ///< a cell
    ServingCell,  ///< the same, of the serving cell alone, where the cell itself has no such key
    Registration, ///< the message of the registration
    Link,         ///< the message of the link
    Levels,       ///< the dictionary of a technology in it
    Context,      ///< a packet-data context
    Addresses,    ///< the dictionary of an IP version in it
    Traffic,      ///< a bearer's row of the traffic
    SIM,          ///< the message of the SIM
    Slot,         ///< a SIM slot in it
    Modem,        ///< the message of the modem
    Position,     ///< the message of the position
    Service,      ///< no message: the service itself uses it
    Unused,
};

/// A row of the table of what ModemManager's members become.
struct MemberRow {
    MemberOf of;
    std::string_view member; ///< ModemManager's name for it; "*" for all of them
    MemberUse use;
    std::string_view key;           ///< the key that it sets, where a message has it
    Value (*convert)(const Value&); ///< none for what cannot be; null where no message has it
    std::string_view note;          ///< the units and encodings, or its use, or why it is unused
    bool listed = false;            ///< the value is appended to the array under the key
};

/// The complete table.
[[nodiscard]] std::span<const MemberRow> memberTable();

/// Sets every key that has this use, in table order, from the members; a key whose member is missing, unknown
/// or out of range is left out. Members that are no dictionary set nothing.
void setKeys(Dictionary& target, MemberUse use, MemberOf of, const Dictionary& members);
void setKeys(Dictionary& target, MemberUse use, MemberOf of, const Value& members);

} // namespace velmora
