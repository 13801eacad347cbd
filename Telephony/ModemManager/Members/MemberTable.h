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
    AnyCell,     ///< a cell of GetCellInfo, of any type
    GSMCell,     ///< one of type GSM
    UMTSCell,    ///< UMTS
    LTECell,     ///< LTE
    OtherCell,   ///< CDMA, TD-SCDMA or 5G NR
    CSLocation,  ///< a part of GetLocation's text "MCC,MNC,LAC,CI,TAC", while registered on GSM or UMTS
    EPSLocation, ///< the same while registered on LTE
    GSMSignal,   ///< the dictionary Modem.Signal.Gsm, and so on
    UMTSSignal,  ///<
    LTESignal,   ///<
    NRSignal,    ///<
    CDMASignal,  ///< Cdma and Evdo
    Modem,       ///< the interface Modem
    Modem3gpp,
    Location, ///< Modem.Location
    Signal,   ///< Modem.Signal, but for its dictionaries
    SIM,
    Bearer,
    BearerProperties, ///< the dictionary Bearer.Properties, and so on
    IPv4,             ///< Ip4Config
    IPv6,             ///< Ip6Config
    Statistics,       ///< Stats
};

/// What a member is used for.
enum class MemberUse : std::uint8_t {
    Cell,        ///< a cell dictionary of the cell information array
    ServingCell, ///< the same, of the serving cell alone, where the cell itself has no such key
    SIMFile,     ///< the SIM's files
    Bearer,      ///< a bearer's dictionary of display values among the packet-data contexts
    Link,        ///< every bearer's dictionary: the radio link that carries it
    Service,     ///< no record: the service itself uses it
    Unused,
};

/// A row of the table of what ModemManager's members become.
struct MemberRow {
    MemberOf of;
    std::string_view member; ///< ModemManager's name for it
    MemberUse use;
    std::string_view key;           ///< the key that it sets, where a record has it
    Value (*convert)(const Value&); ///< none for what cannot be; null where no record has it
    std::string_view note;          ///< the units and encodings, or its use, or why it is unused
};

/// The complete table.
[[nodiscard]] std::span<const MemberRow> memberTable();

/// Sets every key that has this use, in table order, from the members; a key whose member is missing or out
/// of range is left out. Members that are no dictionary set nothing.
void setKeys(Dictionary& target, MemberUse use, MemberOf of, const Dictionary& members);
void setKeys(Dictionary& target, MemberUse use, MemberOf of, const Value& members);

} // namespace velmora
