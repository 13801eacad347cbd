// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Sources/SourceString.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Telephony/Sources/SourceFactory.h"

#include "Platform/TelephonyService.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <set>

namespace velmora {
namespace {

TEST(SourceStringTest, readsScenarios) {
    struct Case {
        const char* text;
        std::uint64_t seed;
        double speed;
    };
    for (const Case& each :
         {Case{"scenario:gsm", 1, 1}, Case{"scenario:gsm,seed=42", 42, 1},
          Case{"scenario:gsm,speed=2.5", 1, 2.5}, Case{"scenario:gsm,speed=1e3,seed=0", 0, 1000},
          Case{"scenario:gsm,seed=18446744073709551615", 18446744073709551615ULL, 1}}) {
        const auto choice = parseSource(each.text);
        ASSERT_TRUE(choice) << each.text;
        const auto* scenario = std::get_if<ScenarioChoice>(&*choice);
        ASSERT_TRUE(scenario) << each.text;
        EXPECT_EQ(scenario->name, "gsm");
        EXPECT_EQ(scenario->seed, each.seed) << each.text;
        EXPECT_EQ(scenario->speed, each.speed) << each.text;
    }
}

TEST(SourceStringTest, LogLinesNameNoIdentity) {
    const std::pair<const char*, const char*> cases[] = {
        {"modemmanager", "modemmanager"},
        {"modemmanager,modem=3", "modemmanager,modem=3"},
        {"modemmanager,modem=/sys/devices/usb1", "modemmanager,modem=/sys/devices/usb1"},
        {"modemmanager,modem=490154203237518", "modemmanager,modem=..."},
        {"modemmanager,sim=8949027500001234568,modem=3", "modemmanager,modem=3,sim=..."},
        {"modemmanager,sim=/org/SIM/1", "modemmanager,sim=/org/SIM/1"},
        {"scenario:gsm,seed=4", "scenario:gsm,seed=4"},
        {"replay:a.pcapng,loop", "replay:a.pcapng,loop"},
    };
    for (const auto& [text, logged] : cases) {
        const auto choice = parseSource(text);
        ASSERT_TRUE(choice) << text;
        EXPECT_EQ(loggedSource(text, *choice), logged);
    }
}

TEST(SourceStringTest, readsReplays) {
    struct Case {
        const char* text;
        const char* file;
        double speed;
        bool loop;
    };
    for (const Case& each :
         {Case{"replay:a.pcapng", "a.pcapng", 1, false}, Case{"replay:a,loop", "a", 1, true},
          Case{"replay:a,speed=max", "a", 0, false}, Case{"replay:a,speed=0,loop", "a", 0, true},
          Case{"replay:a,loop,speed=4", "a", 4, true}, Case{"replay:/x/a,b,c", "/x/a,b,c", 1, false},
          Case{"replay:a,loop,b,speed=2", "a,loop,b", 2, false}, Case{"replay:looper", "looper", 1, false}}) {
        const auto choice = parseSource(each.text);
        ASSERT_TRUE(choice) << each.text;
        const auto* replay = std::get_if<ReplayChoice>(&*choice);
        ASSERT_TRUE(replay) << each.text;
        EXPECT_EQ(replay->file, each.file) << each.text;
        EXPECT_EQ(replay->speed, each.speed) << each.text;
        EXPECT_EQ(replay->loop, each.loop) << each.text;
    }
}

TEST(SourceStringTest, readsTheTechnologyOfAReplay) {
    struct Case {
        const char* text;
        const char* file;
        const char* technology;
    };
    for (const Case& each :
         {Case{"replay:a.dlf", "a.dlf", ""}, Case{"replay:a.dlf,technology=IFX", "a.dlf", "IFX"},
          Case{"replay:a,technology=Ostrel_LTE,loop,speed=2", "a", "Ostrel_LTE"},
          Case{"replay:a,loop,technology=kVoxLogChannelTechnology_Ostrel_GSM", "a", "Ostrel_GSM"},
          Case{"replay:a,technology=IFX,b", "a,technology=IFX,b", ""}}) {
        const auto choice = parseSource(each.text);
        ASSERT_TRUE(choice) << each.text;
        const auto* replay = std::get_if<ReplayChoice>(&*choice);
        ASSERT_TRUE(replay) << each.text;
        EXPECT_EQ(replay->file, each.file) << each.text;
        EXPECT_EQ(replay->technology, each.technology) << each.text;
    }
}

TEST(SourceStringTest, readsModemManager) {
    struct Case {
        const char* text;
        std::string modem;
        std::string sim;
    };
    for (const Case& each : {
             Case{"modemmanager", "", ""},
             Case{"modemmanager,modem=0", "0", ""},
             Case{"modemmanager,modem=4294967295", "4294967295", ""},
             Case{"modemmanager,modem=004999010640000", "004999010640000", ""},
             Case{"modemmanager,modem=80A1b2C3", "80A1b2C3", ""},
             Case{"modemmanager,modem=/sys/devices/x", "/sys/devices/x", ""},
             Case{"modemmanager,sim=89011010000000000017", "", "89011010000000000017"},
             Case{"modemmanager,sim=8901101000000000017F,modem=1", "1", "8901101000000000017F"},
             Case{"modemmanager,sim=/org/freedesktop/ModemManager1/SIM/3", "",
                  "/org/freedesktop/ModemManager1/SIM/3"},
         }) {
        const auto choice = parseSource(each.text);
        ASSERT_TRUE(choice) << each.text;
        const auto* modem = std::get_if<ModemManagerChoice>(&*choice);
        ASSERT_TRUE(modem) << each.text;
        EXPECT_EQ(modem->modem, each.modem) << each.text;
        EXPECT_EQ(modem->sim, each.sim) << each.text;
    }
}

TEST(SourceStringTest, saysWhatIsWrong) {
    struct Case {
        const char* text;
        std::string reason;
    };
    const std::string kinds =
        ", wanted scenario:NAME[,seed=N][,speed=X], "
        "replay:FILE[,speed=X][,loop][,technology=NAME] or modemmanager[,modem=MODEM][,sim=SIM]";
    const std::string indices =
        ", wanted the number at the end of its path, its IMEI, or the path of its device";
    const std::string sims = ", wanted its ICCID of 18 to 20 digits, or the path of its object";
    const std::string scenarios = ", wanted one of: " + scenarioNames();
    const std::string seeds = ", wanted a whole number from 0 to 18446744073709551615";
    const std::string technologies =
        ", wanted one of: IFX, Ostrel_GSM, Ostrel_CDMA, Ostrel_LTE, Ostrel_UTRAN2, Modem";
    const std::string files = ", wanted the name of a file, which is read anew for each client";
    for (const Case& each : {
             Case{"", "source is \"\"" + kinds},
             Case{"gsm", "source is \"gsm\"" + kinds},
             Case{"modemmanager:0", "source is \"modemmanager:0\"" + kinds},
             Case{"modemmanagers", "source is \"modemmanagers\"" + kinds},
             Case{"modemmanager,", "option is \"\", wanted modem=MODEM or sim=SIM"},
             Case{"modemmanager,loop", "option is \"loop\", wanted modem=MODEM or sim=SIM"},
             Case{"modemmanager,modem=", "modem is \"\"" + indices},
             Case{"modemmanager,modem=-1", "modem is \"-1\"" + indices},
             Case{"modemmanager,modem=4294967296", "modem is \"4294967296\"" + indices},
             Case{"modemmanager,modem=1,modem=1", "modem is given twice, wanted once"},
             Case{"modemmanager,modem=/", "modem is \"/\"" + indices},
             Case{"modemmanager,modem=49990106400001234", "modem is \"49990106400001234\"" + indices},
             Case{"modemmanager,sim=", "sim is \"\"" + sims},
             Case{"modemmanager,sim=0", "sim is \"0\"" + sims},
             Case{"modemmanager,sim=89A11010000000000017", "sim is \"89A11010000000000017\"" + sims},
             Case{"modemmanager,sim=//", "sim is \"//\"" + sims},
             Case{"modemmanager,sim=/a,sim=/a", "sim is given twice, wanted once"},
             Case{"Scenario:gsm", "source is \"Scenario:gsm\"" + kinds},
             Case{"scenario:", "scenario is \"\"" + scenarios},
             Case{"scenario:nr", "scenario is \"nr\"" + scenarios},
             Case{"scenario:gsm,seed=abc", "seed is \"abc\"" + seeds},
             Case{"scenario:gsm,seed=-1", "seed is \"-1\"" + seeds},
             Case{"scenario:gsm,seed=1.5", "seed is \"1.5\"" + seeds},
             Case{"scenario:gsm,seed=18446744073709551616", "seed is \"18446744073709551616\"" + seeds},
             Case{"scenario:gsm,seed=1,seed=2", "seed is given twice, wanted once"},
             Case{"scenario:gsm,speed=abc", "speed is \"abc\", wanted a number above 0"},
             Case{"scenario:gsm,speed=", "speed is \"\", wanted a number above 0"},
             Case{"scenario:gsm,speed=0", "speed is \"0\", wanted a number above 0"},
             Case{"scenario:gsm,speed=-1", "speed is \"-1\", wanted a number above 0"},
             Case{"scenario:gsm,speed=inf", "speed is \"inf\", wanted a number above 0"},
             Case{"scenario:gsm,speed=nan", "speed is \"nan\", wanted a number above 0"},
             Case{"scenario:gsm,speed=max", "speed is \"max\", wanted a number above 0"},
             Case{"scenario:gsm,speed=2x", "speed is \"2x\", wanted a number above 0"},
             Case{"scenario:gsm,speed=1,speed=1", "speed is given twice, wanted once"},
             Case{"scenario:gsm,loop", "option is \"loop\", wanted seed=N or speed=X"},
             Case{"scenario:gsm,", "option is \"\", wanted seed=N or speed=X"},
             Case{"replay:", "file is \"\"" + files},
             Case{"replay:-", "file is \"-\"" + files},
             Case{"replay:,loop", "file is \"\"" + files},
             Case{"replay:a,loop,loop", "loop is given twice, wanted once"},
             Case{"replay:a,speed=fast", "speed is \"fast\", wanted a number from 0 up, or max"},
             Case{"replay:a,speed=-2", "speed is \"-2\", wanted a number from 0 up, or max"},
             Case{"replay:a,speed=1,speed=max", "speed is given twice, wanted once"},
             Case{"replay:a,technology=", "technology is \"\"" + technologies},
             Case{"replay:a,technology=GSM", "technology is \"GSM\"" + technologies},
             Case{"replay:a,technology=IFX,technology=IFX", "technology is given twice, wanted once"},
         }) {
        const auto choice = parseSource(each.text);
        ASSERT_FALSE(choice) << each.text;
        EXPECT_EQ(choice.reason(), each.reason) << each.text;
    }
}

TEST(ScenarioRegistryTest, scenariosHaveNamesOfTheirOwnAndAKnownTechnology) {
    std::set<std::string_view> names;
    for (const ScenarioKind& kind : scenarioKinds()) {
        EXPECT_TRUE(names.insert(kind.name).second) << kind.name;
        EXPECT_EQ(scenarioKindNamed(kind.name), &kind);
        EXPECT_THAT(kind.make(1)->technology(),
                    ::testing::AnyOf(kVoxLogChannelTechnology_IFX, kVoxLogChannelTechnology_Ostrel_GSM,
                                     kVoxLogChannelTechnology_Ostrel_CDMA,
                                     kVoxLogChannelTechnology_Ostrel_LTE,
                                     kVoxLogChannelTechnology_Ostrel_UTRAN2, kVoxLogChannelTechnology_Modem));
    }
    EXPECT_TRUE(names.contains("gsm"));
    EXPECT_EQ(scenarioKindNamed("GSM"), nullptr);
}

TEST(SourceHelpTest, hasAnExampleOfEachSource) {
    const std::string help = sourceHelp("velmora-telephonyd");
    EXPECT_THAT(help, ::testing::HasSubstr("velmora-telephonyd --source scenario:gsm"));
    EXPECT_THAT(help, ::testing::HasSubstr("velmora-telephonyd --source replay:"));
    EXPECT_THAT(help, ::testing::HasSubstr("velmora-telephonyd --source modemmanager"));
    for (const ScenarioKind& kind : scenarioKinds())
        EXPECT_THAT(help, ::testing::HasSubstr(std::string(kind.description)));
}

} // namespace
} // namespace velmora
