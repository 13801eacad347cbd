// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Browse/Browser.h"
#include "Tools/Output.h"

#include <cstddef>
#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Recordings as lines of text: a line of standard input is a command, and what follows answers it. Nothing
/// is drawn over, and nothing is said by colours or places alone.
class LineBrowser {
public:
    LineBrowser(std::vector<std::string> files, Browser::Open open, Output& output)
        : _files(std::move(files)), _open(std::move(open)), _output(output) {}

    /// To the end of the input, or until q. Returns the exit status.
    int run();

private:
    [[nodiscard]] bool openFile(std::size_t index, const std::string& technology = {});
    void changeTechnology();
    /// False for q.
    bool take(std::string_view line);
    void find(const std::string& text, SearchPass::Direction direction);
    void goTo(const std::string& text);
    void finishWork();
    void printMessage();
    void printDisplay(bool changesAlone);
    void printFields();
    void printBytes();
    void printEvents();
    void print(std::string_view line);
    void print(const Result<Done>& result);

    std::vector<std::string> _files;
    Browser::Open _open;
    Output& _output;
    std::size_t _file = 0;
    std::unique_ptr<BrowseSession> _session;
    std::string _query;
};

} // namespace velmora
