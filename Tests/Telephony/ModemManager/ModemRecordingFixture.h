// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Telephony/ModemManager/MockModemManager.h"
#include "Tests/Telephony/ModemManager/ModemManagerProcesses.h"

#include <nlohmann/json.hpp>

#include <csignal>
#include <cstddef>
#include <map>
#include <sstream>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

namespace velmora {

/// Records a live modem from LTE over UMTS and standalone NR to lost coverage, until another modem with
/// another SIM replaces it.
class ModemRecordingFixture : public ModemManagerProcesses {
protected:
    using Mock = MockModemManager;
    static constexpr std::string_view identity = "kVoxCellMonitorCellId";

    ModemRecordingFixture() {
        mock.answers["Setup"] = {{}, {}, {}};
        mock.put(Mock::simPath(0), {{Mock::sim,
                                     {{"SimIdentifier", "89111010000000000011"},
                                      {"Imsi", "001011111111111"},
                                      {"OperatorName", "Elder SIM"}}}});
        mock.put(Mock::simPath(2), {{Mock::sim, {{"SimIdentifier", "89011020000000000025"}}}});
        mock.put(
            Mock::bearerPath(5),
            {{Mock::bearer,
              {{"Connected", true},
               {"Interface", "elder0"},
               {"Ip4Config", QVariantMap{{"method", 2U}, {"address", "192.0.2.111"}}},
               {"Stats", QVariantMap{{"rx-bytes", qulonglong(1110)}, {"tx-bytes", qulonglong(1111)}}}}}});
    }

    static QVariant path(const QString& text) { return QVariant::fromValue(QDBusObjectPath(text)); }

    void putElder() {
        InterfaceMap modem = testModem(
            lteAccess,
            {{"Manufacturer", "Elder"},
             {"EquipmentIdentifier", "004999111111111"},
             {"OwnNumbers", QStringList("+111")},
             {"Bearers", QVariant::fromValue(QList<QDBusObjectPath>{QDBusObjectPath(Mock::bearerPath(5))})}});
        modem[Mock::modem3gpp]["OperatorName"] = "Elder Network";
        modem[Mock::signal] = {{"Rate", 5U}, {"Lte", QVariantMap{{"rsrp", -101.0}}}};
        mock.put(Mock::modemPath(0), modem);
    }

    void setCells(const CellList& cells) {
        mock.answers["GetCellInfo"] = {{QVariant::fromValue(cells)}, {}, {}};
        polls = mock.count("GetCellInfo");
    }

    /// Waits for the client's message of those serving cells, and expects it after one poll.
    void expectServing(const TestClient& client, const Value& cell) {
        ASSERT_TRUE(becomes(client, LiveModemCode::cells,
                            {"kVoxCellMonitorCells", "0", std::string(identity)}, cell));
        EXPECT_EQ(mock.count("GetCellInfo"), polls + 1);
    }

    void goToLTE(const TestClient& client) {
        setCells({{{"cell-type", 5U},
                   {"serving", true},
                   {"operator-id", "00101"},
                   {"tac", "84CD"},
                   {"ci", "1A2D003"},
                   {"physical-ci", "1A0"},
                   {"earfcn", 1300U},
                   {"rsrp", -101.0},
                   {"rsrq", -9.5}},
                  {{"cell-type", 5U},
                   {"serving", false},
                   {"physical-ci", "19B"},
                   {"earfcn", 6300U},
                   {"rsrp", -110.5}}});
        putElder();
        expectServing(client, 27447299);
        ASSERT_TRUE(becomes(client, LiveModemCode::sim, {"kVoxSIMOperatorName"}, "Elder SIM"));
        ASSERT_TRUE(becomes(client, LiveModemCode::traffic, {"kVoxTraffic", "0", "kVoxTrafficSent"}, 1111));
        ASSERT_TRUE(becomes(client, LiveModemCode::link, {"kVoxLinkLTE", "kVoxLinkRSRP"}, -101.0));
    }

    void goToUMTS(const TestClient& client) {
        setCells({{{"cell-type", 3U},
                   {"serving", true},
                   {"operator-id", "00101"},
                   {"lac", "1005"},
                   {"ci", "D30156"},
                   {"uarfcn", 10700U},
                   {"psc", 256U},
                   {"rscp", -80.4},
                   {"ecio", -6.5}},
                  {{"cell-type", 2U},
                   {"serving", false},
                   {"arfcn", 62U},
                   {"base-station-id", "3F"},
                   {"rx-level", 40U}}});
        mock.change(Mock::modemPath(0), Mock::signal,
                    {{"Lte", QVariantMap()}, {"Umts", QVariantMap{{"rscp", -80.4}}}});
        mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", umtsAccess}});
        expectServing(client, 13828438);
    }

    void goToStandaloneNR(const TestClient& client) {
        setCells({{{"cell-type", 6U},
                   {"serving", true},
                   {"operator-id", "00101"},
                   {"tac", "10005"},
                   {"ci", "ABCDEF123"},
                   {"physical-ci", "3EF"},
                   {"nrarfcn", 431000U},
                   {"rsrp", -88.5},
                   {"rsrq", -10.5}}});
        mock.change(Mock::modemPath(0), Mock::signal,
                    {{"Umts", QVariantMap()}, {"Nr5g", QVariantMap{{"rsrp", -88.5}}}});
        mock.change(Mock::modemPath(0), Mock::modem, {{"AccessTechnologies", nrAccess}});
        expectServing(client, 46118400291);
    }

    void loseCoverage(const TestClient& client) {
        setCells({});
        mock.change(Mock::modemPath(0), Mock::signal, {{"Nr5g", QVariantMap()}});
        mock.change(Mock::modemPath(0), Mock::modem3gpp,
                    {{"RegistrationState", 2U}, {"OperatorCode", ""}, {"OperatorName", ""}});
        mock.change(Mock::modemPath(0), Mock::modem,
                    {{"AccessTechnologies", 0U},
                     {"State", 7},
                     {"Bearers", QVariant::fromValue(QList<QDBusObjectPath>())}});
        expectServing(client, {});
    }

    void replaceModem(const TestClient& client) {
        mock.remove(Mock::modemPath(0));
        ASSERT_TRUE(becomes(client, LiveModemCode::position, {"kVoxModemPresence"}, 4));
        setCells({{{"cell-type", 2U},
                   {"serving", true},
                   {"operator-id", "00102"},
                   {"lac", "7D0"},
                   {"ci", "4E20"},
                   {"arfcn", 512U},
                   {"base-station-id", "7"},
                   {"rx-level", 50U}}});
        mock.put(Mock::modemPath(3), testModem(gsmAccess, {{"Manufacturer", "Younger"},
                                                           {"OwnNumbers", QStringList()},
                                                           {"Sim", path(Mock::simPath(2))}}));
        expectServing(client, 20000);
        ASSERT_TRUE(becomes(client, LiveModemCode::sim, {"kSimFile_ICCID"}, "89011020000000000025"));
    }

    /// Records the whole drive.
    void record() {
        serve("modemmanager", "<4>modemmanager: no modem is there");
        auto recorder = startTool({"record", recording});
        TestClient client(directory.path(), "com.velmora.test.client");
        ASSERT_TRUE(client.connect());
        // The first message is written: the recorder listens. It is flushed within half a second.
        ASSERT_TRUE(eventually([&] {
            return output({"info", recording}).find("0xFF0007") != std::string::npos;
        }));
        ASSERT_TRUE(client.stream());
        for (const auto phase :
             {&ModemRecordingFixture::goToLTE, &ModemRecordingFixture::goToUMTS,
              &ModemRecordingFixture::goToStandaloneNR, &ModemRecordingFixture::loseCoverage,
              &ModemRecordingFixture::replaceModem}) {
            (this->*phase)(client);
            if (HasFatalFailure())
                return;
        }
        // The recorder may read later than the client.
        ASSERT_TRUE(eventually([&] {
            const std::string shown = output({"decode", "--format", "json", recording});
            return shown.find("89011020000000000025") != std::string::npos &&
                   shown.find("Younger") != std::string::npos;
        }));
        recorder->signal(SIGINT);
        ASSERT_EQ(recorder->exitStatus(), 0) << recorder->standardError();
    }

    [[nodiscard]] std::string run(std::vector<std::string> arguments) const {
        const auto tool = startTool(std::move(arguments));
        EXPECT_EQ(tool->exitStatus(), 0) << tool->standardError();
        return tool->standardOutput();
    }
    /// The output, whatever the status: of a file that is still being written.
    [[nodiscard]] std::string output(std::vector<std::string> arguments) const {
        const auto tool = startTool(std::move(arguments));
        static_cast<void>(tool->exitStatus());
        return tool->standardOutput();
    }

    [[nodiscard]] std::vector<nlohmann::json> samples() const {
        std::istringstream lines(run({"decode", "--samples", "--format", "jsonl", recording}));
        std::vector<nlohmann::json> all;
        for (std::string line; std::getline(lines, line);)
            all.push_back(nlohmann::json::parse(line));
        return all;
    }

    /// The role of each path, of the first row where it is in a list.
    [[nodiscard]] std::map<std::string, std::string> rolesOfPaths() const {
        std::map<std::string, std::string> roles;
        const nlohmann::json catalogue =
            nlohmann::json::parse(run({"fields", "--technology", "Modem", "--format", "json"}));
        for (const nlohmann::json& field : catalogue["fields"]) {
            std::string path = field["path"];
            if (const auto row = path.find('*'); row != std::string::npos)
                path.replace(row, 1, "0");
            if (field.contains("role"))
                roles[path] = field["role"];
        }
        return roles;
    }

    static std::string textOf(const nlohmann::json& sample) {
        const nlohmann::json& value = sample["value"];
        std::string text = value.is_string() ? value.get<std::string>() : value.dump();
        if (sample.contains("unit"))
            text += ' ' + sample["unit"].get<std::string>();
        return text;
    }

    MockModemManager mock{bus.address()};
    std::string recording = directory.path() / "drive.pcapng";
    std::size_t polls = 0; ///< those before the last change
};

} // namespace velmora
