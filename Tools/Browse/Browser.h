// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/BrowseSession.h"
#include "Tools/Browse/Screen/BrowseView.h"
#include "Tools/Terminal/KeyPress.h"
#include "Tools/Terminal/Prompt.h"
#include "Tools/Terminal/ScreenSize.h"

#include <cstddef>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// What the keys do, and what the screen shows then: sessions of one or more files, the part that keys act
/// on, the prompt. It draws nothing itself. Main thread only.
class Browser {
public:
    struct Host {
        std::function<void()> quit;
        std::function<void(const std::string& text)> copy; ///< to the terminal's clipboard
    };
    /// Opens a file of the command line. `technology`: its short name; empty for the one of the command line.
    using Open = std::function<Result<std::unique_ptr<BrowseSession>>(const std::string& path,
                                                                      const std::string& technology)>;

    /// Fails where the first file cannot be opened.
    static Result<std::unique_ptr<Browser>> make(std::vector<std::string> files, Open open, Host host);

    void take(const KeyPress& press, ScreenSize size);
    /// Goes on with what takes long. Whether there is more to do.
    bool work();
    [[nodiscard]] BrowseView view(ScreenSize size);
    [[nodiscard]] BrowseSession& session() { return *_opened[_file].sessions.at(_opened[_file].technology); }

private:
    /// A file of the command line, opened when it is first shown.
    struct OpenedFile {
        std::string technology;                                         ///< that is shown
        std::map<std::string, std::unique_ptr<BrowseSession>> sessions; ///< by technology
    };

    Browser(std::vector<std::string> files, Open open, Host host);
    Result<Done> openFile(std::size_t index, const std::string& technology = {});

    void takeCommand(const KeyPress& press, ScreenSize size);
    void takeLetter(char letter);
    void move(Key key, ScreenSize size);
    void moveInDisplay(Key key, std::size_t page);
    void moveInBytes(Key key, std::size_t perLine, std::size_t page);
    void changePart(int step);
    void changeFile(int step);
    void changeTechnology();
    void changeSection(int step);
    void ask(std::string question, std::string text, std::function<void(const std::string&)> done);
    void askFilter();
    void askTime();
    void askNote();
    void askFile();
    void search(SearchPass::Direction direction);
    void copy();
    void quit();

    void showMessage(BrowseView& view);
    void showEvents(BrowseView& view, std::size_t rows, std::size_t columns);
    [[nodiscard]] std::size_t displayRow(const InspectedMessage& message) const;
    /// The field that the chosen row of the display, or the chosen byte, is of.
    [[nodiscard]] const ReportedField* chosenField(const InspectedMessage& message) const;
    [[nodiscard]] std::string statusOf(const InspectedMessage* message);

    std::vector<std::string> _files;
    Open _open;
    Host _host;
    std::vector<OpenedFile> _opened; ///< by file
    std::size_t _file = 0;
    BrowsePart _part = BrowsePart::Messages;
    std::optional<Prompt> _prompt;
    std::string _query;       ///< of the latest search
    std::string _news;        ///< until the next key
    std::string _displayPath; ///< of the chosen row
    std::size_t _firstDisplayRow = 0;
    std::size_t _byte = 0;
    bool _showsHelp = false;
    bool _isLeaving = false; ///< q has been pressed, and there are notes that are not written
};

} // namespace velmora
