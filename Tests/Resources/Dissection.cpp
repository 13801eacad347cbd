// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Resources/Dissection.h"

#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/ShellCommand.h"

#include <gtest/gtest.h>

#include <fstream>
#include <sstream>

namespace velmora {

std::vector<std::string> dissected(const std::string& path, const std::string& options) {
    const ShellOutcome outcome =
        runShell("LC_ALL=C TZ=UTC tshark -X lua_script:" + shellQuoted(VELMORA_BUILD_DIR "/velmora.lua") +
                 " -r " + shellQuoted(path) + " " + options + " 2>&1 | grep -v '^Running as user'");
    EXPECT_EQ(outcome.output.find("Lua"), std::string::npos) << outcome.output;
    std::istringstream text(outcome.output);
    std::vector<std::string> lines;
    for (std::string line; std::getline(text, line);)
        lines.push_back(line);
    return lines;
}

std::vector<std::string> dissectedFields(const std::string& path,
                                         const std::vector<std::string_view>& fields) {
    std::string options = "-T fields -E separator=/t -E 'aggregator=;'";
    for (const std::string_view field : fields)
        options.append(" -e ").append(field);
    return dissected(path, options);
}

void writeCapture(const std::string& path, std::string_view technology, std::span<const Data> messages) {
    PcapngFile file;
    file.section().messageInterface(technology);
    std::uint64_t moment_ns = 1'767'225'600'000'000'000;
    for (const Data& message : messages) {
        file.message(moment_ns, message.bytes());
        moment_ns += 1'000'000'000;
    }
    std::ofstream out(path, std::ios::binary);
    const Data bytes = file.data();
    for (const std::uint8_t byte : bytes.bytes())
        out.put(static_cast<char>(byte));
    ASSERT_TRUE(out.flush());
}

} // namespace velmora
