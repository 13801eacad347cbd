// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Tools/SeveralTechnologies.h"

#include <algorithm>
#include <sstream>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

/// Runs `decode --samples` on small drives and, with the display templates that are shipped, on the
/// recordings.
class SamplesTest : public SeveralTechnologiesTest {
protected:
    [[nodiscard]] static std::string recording(const std::string& name);
    /// Standard output of `decode --samples` with these arguments.
    std::string samples(std::vector<std::string> arguments, std::optional<std::string> input = std::nullopt) {
        arguments.insert(arguments.begin(), {"decode", "--samples"});
        return run(std::move(arguments), 0, std::move(input));
    }
    [[nodiscard]] static std::string samplesOfRecording(std::vector<std::string> arguments);
    /// The lines that record-values.py prints, which reads a recording without Velmora.
    [[nodiscard]] static std::vector<std::string> recordValues(std::vector<std::string> arguments);

    [[nodiscard]] static std::vector<std::string> lines(const std::string& text) {
        std::vector<std::string> all;
        std::istringstream stream(text);
        for (std::string line; std::getline(stream, line);) {
            if (line.ends_with('\r'))
                line.pop_back();
            all.push_back(line);
        }
        return all;
    }
    /// The rows of a table without quotes, the header first.
    [[nodiscard]] static std::vector<std::vector<std::string>> table(const std::string& text) {
        std::vector<std::vector<std::string>> rows;
        for (const std::string& line : lines(text)) {
            std::vector<std::string> row;
            std::istringstream stream(line + ",");
            for (std::string cell; std::getline(stream, cell, ',');)
                row.push_back(cell);
            rows.push_back(std::move(row));
        }
        return rows;
    }
    /// A drive of a GSM phone: RR State at 0 s, a message that is dropped, and RR State at 2 s.
    void writeDrive(const std::string& name) const {
        writeRecording(name, "Ostrel_GSM",
                       {{at(0), rrState(4)}, {at(500), hex("01 02 03")}, {at(2000), rrState(5)}});
    }
};

} // namespace velmora
