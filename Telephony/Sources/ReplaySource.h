// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/OpenMessages.h"
#include "Telephony/Sources/LogSource.h"
#include "Telephony/Sources/MessagePlayer.h"

#include <cstddef>
#include <cstdint>
#include <functional>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// Plays a file of log messages at the pace of its time stamps, each start from the file's beginning. Time
/// that runs backwards in the file counts as no time, and a pause of more than a minute as one minute. What
/// of the file cannot be read is told in the log, once. Main thread only.
class ReplaySource final : public LogSource {
public:
    using Open = std::function<Result<std::unique_ptr<MessageReader>>()>;

    struct Options {
        double speed = 1;            ///< 0: as fast as the clients take it
        bool loop = false;           ///< at the end begin again, a second later
        std::string technology = {}; ///< goes before the one that the file tells; empty for that one
    };

    /// Opens the file (`open` does; `name` is what messages call it) to learn its technology. Fails for one
    /// that cannot be read or, unless the options name it, does not tell which technology it is of. Queue and
    /// clock must outlive it.
    static Result<std::unique_ptr<ReplaySource>> create(MainQueue& queue, const Clock& clock,
                                                        std::string name, Open open, const Options& options);

    [[nodiscard]] std::string_view technology() const override { return _technology; }
    void start(LogSink& sink) override;
    void stop() override;

private:
    ReplaySource(MainQueue& queue, const Clock& clock, std::string name, std::string technology, Open open,
                 const Options& options);

    bool rewind();
    [[nodiscard]] std::optional<ScenarioEvent> next();
    void tellLosses();
    void tellEnd();

    std::string _name;
    std::string _technology;
    Open _open;
    bool _loop;
    MessagePlayer _player;
    std::unique_ptr<MessageReader> _reader; ///< null when not playing
    std::optional<Time> _lastTime;          ///< of the message before, in this round
    std::chrono::nanoseconds _offset{0};    ///< of the message before
    std::uint64_t _played = 0;              ///< messages of this round
    std::size_t _lossesTold = 0;
    bool _totalTold = false;
};

} // namespace velmora
