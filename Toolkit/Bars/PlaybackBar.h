// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Toolkit/View.h"

#include <cstdint>
#include <functional>
#include <string>
#include <vector>

namespace velmora {

class PlaybackBarWidget;

/// The controls of a recording that is played: buttons, a slider over the whole of it, the moment's time,
/// which can be typed, and the speed. One row, or two where there is less room. While it is on the screen,
/// Space plays and pauses, comma and full stop step by message, with Shift by refresh, and the square
/// brackets step by event, whatever has the keyboard focus but a text field. Needs the application; main
/// thread only.
class PlaybackBar : public View {
public:
    enum class Command : std::uint8_t {
        PlayOrPause,
        EarlierMessage,
        NextMessage,
        EarlierRefresh,
        NextRefresh,
        EarlierEvent,
        NextEvent,
    };
    /// What is done with it. Each may be null.
    struct Actions {
        std::function<void(Command)> command;
        /// The slider was moved to that part of the whole, 0 to 1.
        std::function<void(double part)> seek;
        /// A time was typed. False where it is none.
        std::function<bool(const std::string& time)> typed;
        /// The speed of that index was chosen.
        std::function<void(std::size_t index)> speed;
    };
    struct Shown {
        bool isPlaying = false;
        double part = 0;  ///< of the whole that lies before the moment, 0 to 1
        std::string time; ///< of the moment
        std::size_t speed = 0;
        friend bool operator==(const Shown&, const Shown&) = default;
    };

    /// `speeds`: their titles, slowest first.
    explicit PlaybackBar(const std::vector<std::string>& speeds);
    ~PlaybackBar() override;

    void setActions(Actions actions);
    void show(const Shown& shown);

private:
    PlaybackBarWidget* _bar;
};

} // namespace velmora
