// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/C2K/C2KLogGenerator.h"
#include "Tests/LogGenerator/C2K/ParserHarness.h"
#include "Tests/Support/FakeClock.h"
#include "Tests/Support/FakeResources.h"

#include <gtest/gtest.h>

#include <initializer_list>
#include <memory>
#include <string>

namespace velmora {

inline Value dictionary(std::initializer_list<Dictionary::Entry> entries) {
    return std::make_shared<Dictionary>(entries);
}

/// A finger record without fingers: 23 bytes that are accepted.
inline Data noFingers() {
    return recordWith(0x108A, 23);
}

/// The CDMA2000 decoder with a small template instead of the one that is shipped.
class C2KGeneratorFixture : public testing::Test {
protected:
    C2KGeneratorFixture() {
        resources.put("C2KTemplate", "plist",
                      dictionary({{"Fingers", "kFingerC2I"},
                                  {"Maker", "kUnusedKey"},
                                  {"EV-DO", dictionary({{"_sorted", "_sorted"},
                                                        {"2;Channel", "kChannel"},
                                                        {"1;PN Offset", "kServingPNOffset"},
                                                        {"3;Fingers", "kFingerC2I"}})}}));
    }

    LogLines update(const Data& message) {
        CapturedLog log;
        generator->updateState(state, message);
        return log.lines();
    }
    /// What the next refresh hands over.
    Data raw() {
        static_cast<void>(generator->generateLogUsingState(state));
        return *state["DisplayState"].asData();
    }
    [[nodiscard]] std::string display() { return shown(generator->display(state)); }
    /// Builds the display, so that later lines are the records'.
    void build() { static_cast<void>(C2KLogGenerator::getDisplayFromState(state)); }

    FakeClock clock;
    FakeResources resources;
    std::unique_ptr<C2KLogGenerator> generator = C2KLogGenerator::generator(clock);
    Dictionary state;
};

/// The fixture's display before and after `noFingers`.
inline constexpr const char* emptyDisplay = "{Fingers '', Maker '', EV-DO {_sorted '_sorted', 2;Channel '', "
                                            "1;PN Offset '', 3;Fingers ''}}";
inline constexpr const char* fingersShown =
    "{Fingers '(none)', Maker '', EV-DO {_sorted '_sorted', 2;Channel '', "
    "1;PN Offset '', 3;Fingers '(none)'}}";

} // namespace velmora
