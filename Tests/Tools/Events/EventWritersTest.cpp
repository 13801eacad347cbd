// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Tests/Support/TemporaryDirectory.h"
#include "Tests/Tools/Events/ExampleEvent.h"
#include "Tools/Events/EventLines.h"
#include "Tools/Events/EventRows.h"
#include "Tools/Events/EventText.h"

#include <gtest/gtest.h>

#include <fstream>
#include <limits>
#include <sstream>

#include <fcntl.h>

namespace velmora {
namespace {

class EventWritersTest : public testing::Test {
protected:
    /// What the function writes to the output that it gets.
    template <class Write>
    std::string written(Write write) {
        const std::string path = (_directory / "out").string();
        {
            const FileDescriptor file(::open(path.c_str(), O_CREAT | O_TRUNC | O_WRONLY | O_CLOEXEC, 0600));
            Output output(file.get());
            write(output);
            output.flush();
        }
        std::ostringstream text;
        text << std::ifstream(path, std::ios::binary).rdbuf();
        return text.str();
    }

    std::string asText(const std::vector<Event>& events, EventText::Columns columns = {},
                       bool hasSeveral = false, EventState state = EventState::Complete) {
        return written([&](Output& output) {
            EventText writer(output, _names, columns, [=] { return hasSeveral; });
            writer.begin();
            for (const Event& event : events)
                writer.write(event, state);
        });
    }

    std::string asLines(const Event& event, EventState state = EventState::Complete) {
        return written([&](Output& output) { EventLines(output, _names).write(event, state); });
    }

    std::string asRows(const Event& event, CSVGuard guard = CSVGuard::Off) {
        return written([&](Output& output) {
            EventRows writer(output, _names, guard);
            writer.begin();
            writer.write(event, EventState::Complete);
        });
    }

    [[nodiscard]] static Event handover() {
        Event event = eventAt(1);
        event.text = "handover from PCI 1 to PCI 62";
        event.fields = {{"from", std::string("PCI 1")},
                        {"to", std::string("PCI 62")},
                        {"to.level", -97.25, Unit::DBm},
                        {"known", true}};
        event.evidence = {{0, 12}, {1, 3}};
        return event;
    }

    TemporaryDirectory _directory;
    EvidenceNames _names{{"a.pcapng", "b.pcapng"}};
};

TEST_F(EventWritersTest, TextIsInColumns) {
    Event weak = lastingEvent(61'500, 73'840);
    weak.text = "level below -110 dBm";
    Event open = lastingEvent(80'000, 0, "out-of-service");
    open.end.reset();
    open.severity = Severity::Critical;
    open.text = "no service";
    EXPECT_EQ(asText({handover(), weak, open}),
              "2026-11-16T05:00:00.001Z              info      handover            "
              "handover from PCI 1 to PCI 62\n"
              "2026-11-16T05:01:01.500Z      12.3 s  warning   weak-coverage       level below -110 dBm\n"
              "2026-11-16T05:01:20.000Z      no end  critical  out-of-service      no service\n");
}

TEST_F(EventWritersTest, TextHasTechnologyAndEvidenceWhereAskedFor) {
    EXPECT_EQ(asText({handover()}, {true}, true),
              "2026-11-16T05:00:00.001Z              info      handover            Ostrel_LTE     "
              "handover from PCI 1 to PCI 62  [a.pcapng:12 b.pcapng:3]\n");
    _names.files = {"a.pcapng"};
    Event event = handover();
    event.evidence = {{0, 12}, {0, 15}};
    EXPECT_EQ(asText({event}, {true}), "2026-11-16T05:00:00.001Z              info      handover            "
                                       "handover from PCI 1 to PCI 62  [12 15]\n");
}

TEST_F(EventWritersTest, TextSaysThatAnEventBegins) {
    Event event = lastingEvent(0, 0);
    event.end.reset();
    event.text = "weak";
    EXPECT_EQ(asText({event}, {}, false, EventState::Begins),
              "2026-11-16T05:00:00.000Z      begins  warning   weak-coverage       weak\n");
}

TEST_F(EventWritersTest, TextCannotControlTheTerminal) {
    Event event = eventAt(0, "a\x1b[2J");
    event.text = "b\nc\x07";
    EXPECT_EQ(asText({event}), "2026-11-16T05:00:00.000Z              info      a\\x1B[2J            "
                               "b\\nc\\x07\n");
}

TEST_F(EventWritersTest, LinesHaveAllThatIsKnown) {
    EXPECT_EQ(asLines(handover()),
              R"({"time":"2026-11-16T05:00:00.001000000Z","state":"complete","kind":"handover",)"
              R"("severity":"info","technology":"Ostrel_LTE","text":"handover from PCI 1 to PCI 62",)"
              R"("fields":{"from":"PCI 1","to":"PCI 62","to.level":-97.25,"known":true},)"
              R"("units":{"to.level":"dBm"},)"
              R"("evidence":[{"file":"a.pcapng","record":12},{"file":"b.pcapng","record":3}]})"
              "\n");
}

TEST_F(EventWritersTest, LinesHaveTheEndOfWhatLasts) {
    _names.files.clear();
    Event event = lastingEvent(0, 1500);
    event.evidence = {{0, 7}};
    EXPECT_EQ(asLines(event),
              R"({"time":"2026-11-16T05:00:00.000000000Z","end":"2026-11-16T05:00:01.500000000Z",)"
              R"("state":"complete","kind":"weak-coverage","severity":"warning","technology":"Ostrel_LTE",)"
              R"("text":"","fields":{},"units":{},"evidence":[{"record":7}]})"
              "\n");
    event.end.reset();
    EXPECT_NE(asLines(event, EventState::Begins).find(R"("end":null,"state":"begins",)"), std::string::npos);
}

TEST_F(EventWritersTest, LinesHaveNullForWhatIsNoNumber) {
    Event event = eventAt(0);
    event.fields = {{"value", std::numeric_limits<double>::quiet_NaN(), Unit::DB}};
    EXPECT_NE(asLines(event).find(R"("fields":{"value":null},"units":{"value":"dB"})"), std::string::npos);
}

TEST_F(EventWritersTest, RowsHaveColumnsForTheCommonFields) {
    Event event = handover();
    event.fields.push_back({"value", -3.5, Unit::DB});
    event.fields.push_back({"duration", 12.0, Unit::Second});
    EXPECT_EQ(asRows(event),
              "time,end,state,severity,kind,technology,text,from,to,value,cause,duration,unit,fields,"
              "evidence,latitude,longitude\r\n"
              "2026-11-16T05:00:00.001000000Z,,complete,info,handover,Ostrel_LTE,handover from PCI 1 to PCI "
              "62,PCI 1,PCI 62,-3.5,,12,dB,to.level=-97.25; known=true,a.pcapng:12 b.pcapng:3,,\r\n");
}

TEST_F(EventWritersTest, AllFormsHaveThePlace) {
    const Coordinates place{59.33333333, -18.05};
    const auto endsWith = [](const std::string& text, std::string_view end) {
        EXPECT_TRUE(text.ends_with(end)) << text;
    };
    endsWith(written([&](Output& output) { EventLines(output, _names).write(eventAt(0), {}, place); }),
             R"("evidence":[],"latitude":59.3333333,"longitude":-18.0500000})"
             "\n");
    endsWith(written([&](Output& output) { EventRows(output, _names, {}).write(eventAt(0), {}, place); }),
             ",,,59.3333333,-18.0500000\r\n");
    Event event = eventAt(0);
    event.text = "here";
    const auto asPlacedText = [&](const std::optional<Coordinates>& where) {
        return written([&](Output& output) {
            EventText(output, _names, {false, true}, [] {
                return false;
            }).write(event, EventState::Complete, where);
        });
    };
    endsWith(asPlacedText(place), "handover            59.333333 -18.050000    here\n");
    endsWith(asPlacedText({}), "handover                                    here\n");
}

TEST_F(EventWritersTest, RowsCanBeGuardedAgainstFormulas) {
    Event event = eventAt(0);
    event.text = "=1+1";
    event.fields = {{"from", std::string("+a")}};
    EXPECT_NE(asRows(event, CSVGuard::On).find(",'=1+1,'+a,"), std::string::npos);
    EXPECT_NE(asRows(event).find(",=1+1,+a,"), std::string::npos);
}

} // namespace
} // namespace velmora
