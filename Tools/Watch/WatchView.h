// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/LoopTimer.h"
#include "Tools/LogOverride.h"
#include "Tools/Output.h"
#include "Tools/Terminal/KeyReader.h"
#include "Tools/Terminal/Prompt.h"
#include "Tools/Terminal/Terminal.h"
#include "Tools/Text/TreeText.h"
#include "Tools/Watch/RowSearch.h"
#include "Tools/Watch/TerminalFrame.h"

#include <functional>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Where `watch` shows the display tree. Main thread only.
class WatchView {
public:
    virtual ~WatchView() = default;
    /// A refresh: the status line and the display tree's rows.
    virtual void showRefresh(const std::string& status, std::vector<TreeRow> rows) = 0;
    /// The connection is lost or re-established; the rows are unchanged.
    virtual void showStatus(const std::string& status) = 0;
    /// Something about the connection that the user should know, with what to do about it, which may be
    /// empty. An empty note takes the earlier one away.
    virtual void showNote(const std::string& note, const std::string& advice) = 0;
    /// The line of the latest events, for people at a terminal; `rings`: the terminal's bell.
    virtual void showEvents(const std::string& /*line*/, bool /*rings*/) {}
    /// Whether there is still a reader or a terminal.
    [[nodiscard]] virtual bool isOpen() const = 0;
    /// Restores the terminal, if one is in use.
    virtual void restoreTerminal() {}
};

/// Prints each refresh after its status line, a blank line between two; notes go to standard error.
class PipeView final : public WatchView {
public:
    explicit PipeView(Output& output) : _output(output) {}
    void showRefresh(const std::string& status, std::vector<TreeRow> rows) override;
    void showStatus(const std::string& status) override;
    void showNote(const std::string& note, const std::string& advice) override;
    [[nodiscard]] bool isOpen() const override { return _output.isOpen() && !_output.hasClosedReader(); }

private:
    Output& _output;
    bool _begun = false;
};

/// Shows the latest refresh on the terminal, a note after the status, and the advice in place of the rows, or
/// after the note where there are rows.
/// Log lines that would run into the screen are held until it is restored.
class ScreenView final : public WatchView {
public:
    /// `quit` is called when the user quits or the terminal has been closed.
    explicit ScreenView(std::function<void()> quit);
    void showRefresh(const std::string& status, std::vector<TreeRow> rows) override;
    void showStatus(const std::string& status) override;
    void showNote(const std::string& note, const std::string& advice) override;
    void showEvents(const std::string& line, bool rings) override;
    [[nodiscard]] bool isOpen() const override { return true; }
    void restoreTerminal() override;

private:
    void handleInput(std::string_view bytes);
    bool take(const std::vector<KeyPress>& presses);
    void takeLetter(const std::string& letter);
    void takeInPrompt(const KeyPress& press);
    void search(SearchDirection direction);
    void scrollTo(const std::optional<std::size_t>& row);
    [[nodiscard]] ScreenLayout layout() const;
    [[nodiscard]] std::vector<TreeRow> shownRows() const;
    void draw();

    std::function<void()> _quit;
    std::unique_ptr<DeferredLog>
        _deferredLog; ///< declared before the terminal: its lines come after the screen is restored
    Terminal _terminal;
    KeyReader _keys;
    LoopTimer _escape; ///< until an Escape is a key of its own
    std::optional<Prompt> _prompt;
    std::string _query;  ///< of the latest search
    std::string _filter; ///< only rows with it are shown; empty for all
    std::string _status;
    std::string _note;
    std::string _advice;
    std::string _events;
    std::vector<TreeRow> _rows;
    std::size_t _scroll = 0;
};

} // namespace velmora
