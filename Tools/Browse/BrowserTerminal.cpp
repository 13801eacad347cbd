// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/BrowserTerminal.h"

#include "Platform/Base64.h"
#include "Platform/Linux/LoopTimer.h"
#include "Platform/Linux/MainLoop.h"
#include "Platform/Linux/SignalWatcher.h"
#include "Tools/Browse/Screen/BrowseScreen.h"
#include "Tools/ExitStatus.h"
#include "Tools/LogOverride.h"
#include "Tools/Report.h"
#include "Tools/Terminal/KeyReader.h"
#include "Tools/Terminal/ScreenPainter.h"
#include "Tools/Terminal/Terminal.h"

#include <chrono>
#include <memory>
#include <string_view>

#include <unistd.h>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// How long an Escape waits for the rest of a key's sequence.
constexpr auto escapeDelay = 50ms;
/// How often progress is shown.
constexpr auto progressInterval = 100ms;

/// What the terminal's clipboard gets: the control sequence 52 of xterm, which others have taken over.
std::string clipboardSequence(const std::string& text) {
    std::string encoded(base64Size(text.size()), ' ');
    putBase64(encoded.data(), Bytes(reinterpret_cast<const std::uint8_t*>(text.data()), text.size()));
    return "\x1b]52;c;" + encoded + "\a";
}

/// A browser on the terminal: keys, drawing, and work in between.
class BrowserTerminal {
public:
    explicit BrowserTerminal(MainLoop& loop)
        : _loop(loop), _work([this] { work(); }), _escape([this] { take(_keys.finish()); }) {}

    [[nodiscard]] Browser::Host host() {
        return {[this] { _loop.quit(ExitStatus::Done); },
                [this](const std::string& text) { _terminal->draw(clipboardSequence(text)); }};
    }

    int run(Browser& browser) {
        _browser = &browser;
        const WorkContext context({}, [this] {
            if (_terminal)
                _terminal->restore();
        });
        const SignalWatcher signals([this](int) { _loop.quit(ExitStatus::Done); });
        if (::isatty(STDERR_FILENO) != 0)
            _deferredLog = std::make_unique<DeferredLog>();
        _terminal = std::make_unique<Terminal>(
            Terminal::Events{[this](std::string_view bytes) { takeBytes(bytes); }, [this] { draw(); },
                             [this] { _loop.quit(ExitStatus::Done); }});
        browser.work(); // so that the first screen has messages
        draw();
        _work.startOnce(0ms);
        const int status = _loop.run();
        _terminal.reset();
        _deferredLog.reset();
        return status;
    }

private:
    void takeBytes(std::string_view bytes) {
        take(_keys.take(bytes));
        if (_keys.isWaiting())
            _escape.startOnce(escapeDelay);
        else
            _escape.stop();
    }

    void take(const std::vector<KeyPress>& presses) {
        for (const KeyPress& press : presses) {
            if (press.key == Key::Suspend)
                _terminal->suspend();
            else if (press.key == Key::Redraw)
                _terminal->draw("\x1b[2J");
            else
                _browser->take(press, _terminal->size());
        }
        draw();
        if (!_work.isRunning())
            _work.startOnce(0ms);
    }

    void work() {
        const bool goesOn = _browser->work();
        const auto now = std::chrono::steady_clock::now();
        if (!goesOn || now - _drawn >= progressInterval)
            draw();
        if (goesOn)
            _work.startOnce(0ms);
    }

    void draw() {
        _drawn = std::chrono::steady_clock::now();
        const ScreenSize size = _terminal->size();
        _terminal->draw(paintedScreen(browseScreen(_browser->view(size), size, _characters), _colours));
    }

    MainLoop& _loop;
    Browser* _browser = nullptr;
    std::unique_ptr<DeferredLog> _deferredLog;
    std::unique_ptr<Terminal> _terminal;
    KeyReader _keys;
    LoopTimer _work;
    LoopTimer _escape;
    Colours _colours = coloursOfEnvironment();
    Characters _characters = charactersOfEnvironment();
    std::chrono::steady_clock::time_point _drawn;
};

} // namespace

int browseOnTerminal(const std::vector<std::string>& files, const Browser::Open& open) {
    MainLoop loop;
    BrowserTerminal terminal(loop);
    const Result<std::unique_ptr<Browser>> browser = Browser::make(files, open, terminal.host());
    if (!browser) {
        report(browser.reason());
        return ExitStatus::BadInput;
    }
    return terminal.run(**browser);
}

} // namespace velmora
