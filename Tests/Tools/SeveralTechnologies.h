// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Recording/PcapngFile.h"
#include "Tests/Tools/ToolFixture.h"

#include <fstream>
#include <string>

namespace velmora {

/// Recordings of a GSM phone and an IFX phone in one file, as capture tools merge them.
class SeveralTechnologiesTest : public ToolTest {
protected:
    [[nodiscard]] static Data ifxBand(const char* band) {
        const DictionaryRef display = makeDictionary();
        display->set("Band", band);
        display->set("State", "idle");
        return serialized(display);
    }
    static std::uint64_t stamp(std::int64_t milliseconds) {
        return static_cast<std::uint64_t>(at(milliseconds).time_since_epoch().count());
    }

    /// Refreshes lie at 2 s and 4 s, and at 2.5 s and 8.5 s.
    [[nodiscard]] static PcapngFile both() {
        PcapngFile file;
        file.section().messageInterface("Ostrel_GSM").messageInterface("IFX");
        file.message(stamp(0), rrState(4).bytes(), 0);
        file.message(stamp(500), ifxBand("GSM 900").bytes(), 1);
        file.message(stamp(2100), rrState(5).bytes(), 0);
        file.message(stamp(7000), ifxBand("GSM 1800").bytes(), 1);
        return file;
    }
    void write(const std::string& name, PcapngFile file) const {
        const std::vector<std::uint8_t>& bytes = file.bytes();
        std::ofstream(path(name), std::ios::binary)
            .write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    }
    /// Standard output of a run that ends with that status; `_errors` are its messages.
    std::string run(std::vector<std::string> arguments, int status = 0,
                    std::optional<std::string> input = std::nullopt) {
        arguments.insert(arguments.begin(), {"--log-level", "0"});
        ToolProcess::Setup setup = tool(std::move(arguments));
        setup.input = std::move(input);
        ToolProcess process(setup);
        EXPECT_EQ(process.exitStatus(), status) << process.errors();
        _errors = ownMessages(process.errors());
        return process.output();
    }

    std::string _errors;
};

} // namespace velmora
