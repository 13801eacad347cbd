// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Recording/OpenMessages.h"
#include "Tests/Tools/Events/EventsFixture.h"

#include <algorithm>
#include <filesystem>

namespace velmora {
namespace {

/// A recording of each technology.
class CutRecordingTest : public EventsTest, public testing::WithParamInterface<const char*> {
protected:
    CutRecordingTest() {
        const auto reader = openMessages(recordings + GetParam());
        while (const auto message = (*reader)->next())
            _messages.push_back({message->time, Data::copyOf(message->message.bytes())});
        _technology = (*reader)->technology();
    }
    void write(const std::string& name, std::size_t from, std::size_t to) const {
        const auto at = [this](std::size_t index) {
            return _messages.begin() + static_cast<std::ptrdiff_t>(index);
        };
        writeRecording(name, _technology, {at(from), at(to)});
    }

    std::vector<TimedMessage> _messages;
    std::string _technology;
};

TEST_P(CutRecordingTest, TwoFilesHaveTheEventsOfTheWhole) {
    write("whole.pcapng", 0, _messages.size());
    const std::vector<nlohmann::json> whole = listed({path("whole.pcapng")});
    EXPECT_GT(whole.size(), 10U);
    for (const std::size_t percent : {10U, 35U, 50U, 90U}) {
        const std::size_t cut = _messages.size() * percent / 100;
        write("first.pcapng", 0, cut);
        write("second.pcapng", cut, _messages.size());
        std::vector<nlohmann::json> events = listed({path("first.pcapng"), path("second.pcapng")});
        // The records of the second file, by their numbers in the whole.
        for (nlohmann::json& event : events)
            for (nlohmann::json& record : event.at("evidence")) {
                if (record.at("file") == path("second.pcapng"))
                    record["record"] = record.at("record").get<std::size_t>() + cut;
                record["file"] = path("whole.pcapng");
            }
        EXPECT_EQ(events, whole) << percent << " %";
        std::filesystem::remove(path("first.pcapng"));
        std::filesystem::remove(path("second.pcapng"));
    }
}

INSTANTIATE_TEST_SUITE_P(Technologies, CutRecordingTest,
                         testing::Values("gsm.pcapng", "lte.pcapng", "utran.pcapng", "c2k.pcapng",
                                         "ifx.pcapng", "modem.pcapng"),
                         [](const auto& each) {
                             const std::string name = each.param;
                             return name.substr(0, name.find('.'));
                         });

} // namespace
} // namespace velmora
