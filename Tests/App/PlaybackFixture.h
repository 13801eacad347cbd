// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "App/Playback/PlaybackController.h"
#include "Tests/App/SaveScreenFixture.h"

#include <filesystem>
#include <string>
#include <utility>
#include <vector>

class QWidget;

namespace velmora {

/// A recording of displays in the test's directory, on the screens.
class PlaybackFixture : public SaveScreenFixture {
protected:
    /// A display and when it arrived, in milliseconds after the clock's start.
    using Arrival = std::pair<int, Value>;

    static Value band(const std::string& name) { return dictionary({{"Band", name}, {"Cell", "12"}}); }
    /// Five displays, with refreshes 2 and 4 s after the first.
    static std::vector<Arrival> fiveBands() {
        return {{0, band("A")}, {500, band("B")}, {1500, band("C")}, {2500, band("D")}, {4500, band("E")}};
    }

    std::string write(const std::string& name, const std::vector<Arrival>& arrivals) const;
    /// Opens it while nothing is received, and reads all of it.
    void openPaused(const std::string& path);
    void press(int key);
    /// What is queued and has waited that long happens.
    void pass(std::chrono::milliseconds time);
    [[nodiscard]] QWidget* window() const;
    [[nodiscard]] QWidget* part(const char* name) const;
    [[nodiscard]] std::string shownBand() const;
    [[nodiscard]] std::string shownNotice() const;
};

} // namespace velmora
