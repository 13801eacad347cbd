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

/// Plays a file of log messages by its time stamps, each start from the file's first message. Time that goes
/// backward counts as zero, and a pause of more than a minute as one minute. Losses in the file are logged
/// once. Main thread only.
class ReplaySource final : public LogSource {
public:
    using Open = std::function<Result<std::unique_ptr<MessageReader>>()>;

    struct Options {
        double speed = 1;            ///< 0: as fast as the clients take it
        bool loop = false;           ///< restart at the end, after a second
        std::string technology = {}; ///< overrides the file's; empty for the file's
    };

    /// Opens the file by `open` to determine its technology; messages use `name` for it. Fails for a file
    /// that cannot be read or, unless the options have it, whose technology is unknown. Queue and clock must
    /// outlive it.
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
    void reportLosses();
    void reportEnd();

    std::string _name;
    std::string _technology;
    Open _open;
    bool _loop;
    MessagePlayer _player;
    std::unique_ptr<MessageReader> _reader; ///< null when not playing
    std::optional<Time> _lastTime;          ///< of the previous message, in this round
    std::chrono::nanoseconds _offset{0};    ///< of the previous message
    std::uint64_t _played = 0;              ///< messages of this round
    std::size_t _lossesReported = 0;
    bool _totalReported = false;
};

} // namespace velmora
