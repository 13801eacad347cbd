// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/App/AppFixture.h"

#include "Platform/Linux/Files/Files.h"
#include "PropertyLists/PropertyList.h"

#include <algorithm>
#include <chrono>
#include <filesystem>
#include <string>
#include <vector>

namespace velmora {

/// The application with its save screen, and the snapshots that it writes.
class SaveScreenFixture : public AppFixture {
protected:
    /// 2026-11-16 05:00:00 UTC, where the clock starts, in seconds since 1970.
    static constexpr long startSeconds = 1794805200;

    static Value display(const std::string& state) { return dictionary({{"State", state}, {"Cell", "12"}}); }

    void open() {
        app.showSaveView();
        runUntilIdle();
        ASSERT_NE(saveScreen(), nullptr);
    }
    /// Presses Save and lets the screen close.
    void save() {
        saveScreen()->savePressed();
        platform.queue.runPending();
        runUntilIdle();
    }
    [[nodiscard]] std::vector<std::string> listed() const {
        TableView& table = saveScreen()->saveContentTable();
        std::vector<std::string> texts;
        for (const IndexPath& path : table.indexPathsForVisibleRows())
            texts.push_back(table.cellForRow(path)->textLabel().text());
        return texts;
    }
    /// The names of the files in the log directory, sorted.
    [[nodiscard]] std::vector<std::string> files() const {
        std::vector<std::string> names;
        for (const auto& entry : std::filesystem::directory_iterator(directory / "logs"))
            names.push_back(entry.path().filename().string());
        std::sort(names.begin(), names.end());
        return names;
    }
    [[nodiscard]] std::filesystem::path file(long seconds) const {
        return directory / "logs" / ("VelmoraSnapshot-" + std::to_string(seconds) + ".velmora");
    }
    [[nodiscard]] Value content(long seconds) const {
        const auto bytes = readFile(file(seconds), std::size_t{1} << 20);
        if (!bytes)
            return Value("file: " + bytes.reason());
        const auto list = readPropertyList(bytes->bytes());
        return list ? *list : Value("list: " + list.reason());
    }
};

} // namespace velmora
