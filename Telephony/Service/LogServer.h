// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/MainQueue.h"
#include "Platform/MessagePort.h"
#include "Platform/PeerLog.h"
#include "Platform/Result.h"
#include "Telephony/Service/LogChannel.h"
#include "Telephony/Sources/LogSource.h"

#include <chrono>
#include <cstdint>
#include <functional>
#include <map>
#include <memory>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// The telephony service's ports: the server port, on which clients request log channels, and the channels.
///
/// The source runs while at least one channel streams. It is started with the first one and stopped after the
/// last, so that a single client always gets the stream from its start. A client that joins later first gets
/// the latest message of each code of the extra stream, since those describe a state. A channel closes when
/// the connection to its client's port ends, when a new one is made for the same port, or when it does not
/// stream while many are open. When the source's
/// technology changes all channels close, so that their clients reconnect and query it again; while the
/// source's technology is unknown, GetTechnology is answered without one. Invalid commands are logged as
/// errors and ignored. Main thread only.
class LogServer final : private LogSink {
public:
    /// The reasons for refusing a request for a channel.
    enum class Refusal : std::int32_t {
        NoSuchPort = 1,      ///< the named port cannot be connected to
        Malformed = 2,       ///< the request is no dictionary that names a port
        TooManyChannels = 3, ///< `maximumChannels` are open
        NoChannelPort = 4,   ///< no port could be made for the channel
        ServicePort = 5,     ///< the named port is the service's own, or reserved for its channels
    };
    static constexpr std::size_t maximumChannels = 64;
    /// From this number on, channels that have been open for `idleTimeout` without streaming are closed, so
    /// that clients that ask for nothing keep no other client out.
    static constexpr std::size_t manyChannels = 48;
    static constexpr std::chrono::seconds idleTimeout{10};

    /// How many codes of the extra stream are cached; an unusual recording may have many.
    static constexpr std::size_t maximumCachedExtra = 16;

    /// All three must outlive the server.
    LogServer(MessagePorts& ports, MainQueue& queue, LogSource& source);
    ~LogServer() override;
    LogServer(const LogServer&) = delete;
    LogServer& operator=(const LogServer&) = delete;

    /// Takes the service's name and serves from now on. `onPortLost` is called when the platform closes the
    /// server port. Fails when another service has the name or no port can be made.
    Result<Done> listen(std::function<void()> onPortLost);
    /// Closes all ports and stops the source. Does nothing when not listening.
    void stop();

    [[nodiscard]] std::size_t channelCount() const { return _channels.size(); }

private:
    using ChannelRef = std::shared_ptr<LogChannel>;

    void receive(const Data& message) override;
    [[nodiscard]] bool hasRoom() const override;
    void sourceEnded() override;

    [[nodiscard]] Value createChannel(const Data& request);
    /// Logs why the request is refused; the reply to it.
    [[nodiscard]] Value refuse(Refusal reason, const std::string& why);
    [[nodiscard]] std::shared_ptr<LocalPort> createChannelPort();
    /// `why` is logged.
    void close(LogChannel& channel, const std::string& why);
    void technologyChanged();
    /// Where many channels are open: closes, after the time-out, those that do not stream now nor then.
    void watchIdleChannels();
    void closeIdle(const std::vector<std::weak_ptr<LogChannel>>& idle);
    /// Removes closed channels from `_channels` and stops the source after the last.
    void removeClosedChannels();
    [[nodiscard]] std::optional<Data> command(const std::string& channelName, const Data& payload);
    void startStreaming(LogChannel& channel, const Dictionary& command);
    void cacheExtra(const Data& message);

    MessagePorts& _ports;
    MainQueue& _queue;
    LogSource& _source;
    PeerLog _log{_queue};
    std::shared_ptr<LocalPort> _serverPort;
    std::vector<ChannelRef> _channels;
    std::uint64_t _channelsMade = 0;
    bool _sourceRuns = false;
    bool _watchesIdle = false;                  ///< a check of idle channels is due
    bool _sourceEnded = false;                  ///< its present run has no more messages
    std::map<std::uint16_t, Data> _latestExtra; ///< of the source's present run, by code
    /// Queued tasks hold it weakly: they do nothing after the server's destruction.
    std::shared_ptr<bool> _alive = std::make_shared<bool>(true);
};

} // namespace velmora
