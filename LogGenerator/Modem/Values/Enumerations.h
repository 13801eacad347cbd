// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/EnumTexts.h"

/// ModemManager's enumerations, as its published constants have them. What they do not have shows its number.
namespace velmora::LiveModem {

inline constexpr EnumText stateRows[] = {
    {0, "Unknown"},
    {1, "Initializing"},
    {2, "Locked"},
    {3, "Disabled"},
    {4, "Disabling"},
    {5, "Enabling"},
    {6, "Enabled"},
    {7, "Searching"},
    {8, "Registered"},
    {9, "Disconnecting from packet data"},
    {10, "Connecting to packet data"},
    {11, "Connected"},
    {0xFFFFFFFF, "Failed"}, // -1
};
inline constexpr EnumTexts modemStates(stateRows, "Unknown (", ")");

inline constexpr EnumText failureRows[] = {
    {1, "unknown reason"},       {2, "SIM missing"},          {3, "SIM error"},
    {4, "unknown capabilities"}, {5, "eSIM without profile"},
};
inline constexpr EnumTexts failures(failureRows, "unknown reason (", ")");

inline constexpr EnumText lockRows[] = {
    {2, "SIM PIN"},
    {3, "SIM PIN2"},
    {4, "SIM PUK"},
    {5, "SIM PUK2"},
    {6, "service provider PIN"},
    {7, "service provider PUK"},
    {8, "network PIN"},
    {9, "network PUK"},
    {10, "PIN of the phone for this SIM"},
    {11, "corporate PIN"},
    {12, "corporate PUK"},
    {13, "PIN of the phone for its first SIM"},
    {14, "PUK of the phone for its first SIM"},
    {15, "network subset PIN"},
    {16, "network subset PUK"},
};
inline constexpr EnumTexts locks(lockRows, "unknown code (", ")");

inline constexpr EnumText powerRows[] = {{1, "Off"}, {2, "Low"}, {3, "On"}};
inline constexpr EnumTexts powerStates(powerRows, "Unknown (", ")");

inline constexpr EnumText registrationRows[] = {
    {0, "Idle"},
    {1, "Registered, home"},
    {2, "Searching"},
    {3, "Denied"},
    {4, "Unknown"},
    {5, "Registered, roaming"},
    {6, "Registered for SMS only, home"},
    {7, "Registered for SMS only, roaming"},
    {8, "Emergency calls only"},
    {9, "Registered without preferred CSFB, home"},
    {10, "Registered without preferred CSFB, roaming"},
    {11, "Attached for restricted local services"},
};
inline constexpr EnumTexts registrationStates(registrationRows, "Unknown (", ")");

inline constexpr EnumText packetServiceRows[] = {{1, "Detached"}, {2, "Attached"}};
inline constexpr EnumTexts packetServiceStates(packetServiceRows, "Unknown (", ")");

inline constexpr EnumText cdmaRegistrationRows[] = {
    {1, "Registered"}, {2, "Registered, home"}, {3, "Registered, roaming"}};
inline constexpr EnumTexts cdmaRegistrationStates(cdmaRegistrationRows, "Unknown (", ")");

inline constexpr EnumText bearerRows[] = {{1, "Default"}, {2, "Default for attach"}, {3, "Dedicated"}};
inline constexpr EnumTexts bearerTypes(bearerRows, "Unknown (", ")");

inline constexpr EnumText methodRows[] = {{1, "PPP"}, {2, "Static"}, {3, "DHCP"}};
inline constexpr EnumTexts addressMethods(methodRows, "Unknown (", ")");

inline constexpr EnumText simTypeRows[] = {{1, "Physical"}, {2, "eSIM"}};
inline constexpr EnumTexts simTypes(simTypeRows, "Unknown (", ")");

} // namespace velmora::LiveModem
