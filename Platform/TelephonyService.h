// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <algorithm>
#include <array>
#include <cstdint>
#include <functional>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// The result of a call to the telephony service; a code of 0 is success.
struct VoxError {
    std::int32_t domain = 0;
    std::int32_t code = 0;
};

/// A connection to the telephony service, held while calls are made on it.
class VoxServerConnection {
public:
    virtual ~VoxServerConnection() = default;
};

/// The telephony service's client calls, under the names that the service gives them.
class TelephonyService {
public:
    virtual ~TelephonyService() = default;

    /// Connects to the service; null when it is not running. `callback` runs on the main queue for events of
    /// this connection while the connection is held.
    [[nodiscard]] virtual std::shared_ptr<VoxServerConnection>
    _VoxServerConnectionCreate(std::function<void()> callback) = 0; // NOLINT: the service's own name

    /// Asks for a log channel that sends to the local port `localPortName`; `remotePortName` becomes the name
    /// of the port that takes the channel's commands. It may be empty, by an error of the service.
    [[nodiscard]] virtual VoxError
    _VoxServerConnectionNetworkMonitorCreateLogChannel( // NOLINT: the service's own name
        VoxServerConnection& connection, const std::string& localPortName, std::string& remotePortName) = 0;
};

/// The strings that the service publishes. Each is equal to its own name; compare them by value.
inline constexpr std::string_view kVoxLogChannelTechnology_IFX = "kVoxLogChannelTechnology_IFX";
inline constexpr std::string_view kVoxLogChannelTechnology_Ostrel_GSM = "kVoxLogChannelTechnology_Ostrel_GSM";
inline constexpr std::string_view kVoxLogChannelTechnology_Ostrel_CDMA =
    "kVoxLogChannelTechnology_Ostrel_CDMA";
inline constexpr std::string_view kVoxLogChannelTechnology_Ostrel_LTE = "kVoxLogChannelTechnology_Ostrel_LTE";
inline constexpr std::string_view kVoxLogChannelTechnology_Ostrel_UTRAN2 =
    "kVoxLogChannelTechnology_Ostrel_UTRAN2";
/// A live modem, whatever its radio technology: the extra stream alone.
inline constexpr std::string_view kVoxLogChannelTechnology_Modem = "kVoxLogChannelTechnology_Modem";

/// All of them.
inline constexpr std::array voxTechnologies = {
    kVoxLogChannelTechnology_IFX,           kVoxLogChannelTechnology_Ostrel_GSM,
    kVoxLogChannelTechnology_Ostrel_CDMA,   kVoxLogChannelTechnology_Ostrel_LTE,
    kVoxLogChannelTechnology_Ostrel_UTRAN2, kVoxLogChannelTechnology_Modem,
};

/// The prefix of a technology's short name ("Ostrel_GSM") in the service's constant.
inline constexpr std::string_view voxTechnologyPrefix = "kVoxLogChannelTechnology_";

/// The short name that people and recordings use: "Ostrel_GSM" of "kVoxLogChannelTechnology_Ostrel_GSM". A
/// name without the prefix is returned as it is.
[[nodiscard]] constexpr std::string_view shortTechnologyName(std::string_view technology) {
    if (technology.starts_with(voxTechnologyPrefix))
        technology.remove_prefix(voxTechnologyPrefix.size());
    return technology;
}

/// A technology's name on the screens: "Ostrel GSM" of "kVoxLogChannelTechnology_Ostrel_GSM".
[[nodiscard]] inline std::string technologyTitle(std::string_view technology) {
    std::string title(shortTechnologyName(technology));
    std::replace(title.begin(), title.end(), '_', ' ');
    return title;
}

/// The service's constant for a short name; a constant is returned as it is.
[[nodiscard]] inline std::string technologyConstant(std::string_view name) {
    return std::string(voxTechnologyPrefix) + std::string(shortTechnologyName(name));
}

/// The short names of all technologies, as users write them: "IFX, Ostrel_GSM, ...".
[[nodiscard]] inline std::string technologyNames() {
    std::string names;
    for (const std::string_view technology : voxTechnologies) {
        names += names.empty() ? "" : ", ";
        names += shortTechnologyName(technology);
    }
    return names;
}

/// Whether the name, in short or the service's constant, is one of the technologies'.
[[nodiscard]] inline bool isTechnology(std::string_view name) {
    for (const std::string_view technology : voxTechnologies)
        if (shortTechnologyName(technology) == shortTechnologyName(name))
            return true;
    return false;
}

/// The keys of a cell dictionary in the cell information array, and the values of the two that are compared.
inline constexpr std::string_view kVoxCellMonitorCellRadioAccessTechnology =
    "kVoxCellMonitorCellRadioAccessTechnology";
inline constexpr std::string_view kVoxCellMonitorRadioAccessTechnologyGSM =
    "kVoxCellMonitorRadioAccessTechnologyGSM";
inline constexpr std::string_view kVoxCellMonitorRadioAccessTechnologyUMTS =
    "kVoxCellMonitorRadioAccessTechnologyUMTS";
inline constexpr std::string_view kVoxCellMonitorRadioAccessTechnologyUTRAN =
    "kVoxCellMonitorRadioAccessTechnologyUTRAN";
inline constexpr std::string_view kVoxCellMonitorRadioAccessTechnologyLTE =
    "kVoxCellMonitorRadioAccessTechnologyLTE";
inline constexpr std::string_view kVoxCellMonitorCellType = "kVoxCellMonitorCellType";
inline constexpr std::string_view kVoxCellMonitorCellTypeServing = "kVoxCellMonitorCellTypeServing";
inline constexpr std::string_view kVoxCellMonitorCellTypeNeighbor = "kVoxCellMonitorCellTypeNeighbor";
inline constexpr std::string_view kVoxCellMonitorMCC = "kVoxCellMonitorMCC";
inline constexpr std::string_view kVoxCellMonitorMNC = "kVoxCellMonitorMNC";
inline constexpr std::string_view kVoxCellMonitorLAC = "kVoxCellMonitorLAC";
inline constexpr std::string_view kVoxCellMonitorTAC = "kVoxCellMonitorTAC";
inline constexpr std::string_view kVoxCellMonitorCellId = "kVoxCellMonitorCellId";
inline constexpr std::string_view kVoxCellMonitorARFCN = "kVoxCellMonitorARFCN";
inline constexpr std::string_view kVoxCellMonitorUARFCN = "kVoxCellMonitorUARFCN";
inline constexpr std::string_view kVoxCellMonitorPID = "kVoxCellMonitorPID";
inline constexpr std::string_view kVoxCellMonitorSCN = "kVoxCellMonitorSCN";
inline constexpr std::string_view kVoxCellMonitorRSSI = "kVoxCellMonitorRSSI";
inline constexpr std::string_view kVoxCellMonitorRSCP = "kVoxCellMonitorRSCP";
inline constexpr std::string_view kVoxCellMonitorECN0 = "kVoxCellMonitorECN0";
inline constexpr std::string_view kVoxCellMonitorBandInfo = "kVoxCellMonitorBandInfo";

/// The protocol between the application and the service's ports: property lists in messages of id 0.
namespace vox {
/// The name under which the service listens.
inline constexpr std::string_view serverPortName = "com.velmora.vox.server";
/// A request to the server port: {"CreateLogChannel": name of the application's local port}. The answer is
/// {"Port": name of the channel's port}, or {"Error": code} where there is none.
inline constexpr std::string_view createLogChannelKey = "CreateLogChannel";
inline constexpr std::string_view portKey = "Port";
inline constexpr std::string_view errorKey = "Error";
/// A request to a channel's port: {"GetTechnology": "GetTechnology"}. The answer holds the technology's
/// constant under the same key.
inline constexpr std::string_view getTechnologyKey = "GetTechnology";
/// The start command, one-way: {"SetState": "Streaming"} and, from the binary technologies, the two lists of
/// codes.
inline constexpr std::string_view setStateKey = "SetState";
inline constexpr std::string_view streamingState = "Streaming";
inline constexpr std::string_view setOstrelLogCodesKey = "SetOstrelLogCodes";
inline constexpr std::string_view setVoxExtraCodesKey = "SetVoxExtraCodes";
/// Log messages have id 0. An empty message of this id after the last one says that the source has ended: no
/// more follow until the service starts it again. Clients may ignore it.
inline constexpr std::int32_t sourceEndedMessage = 1;
} // namespace vox

} // namespace velmora
