// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/LiveEvents.h"

#include "Platform/Linux/SignalWatcher.h"
#include "Platform/TelephonyService.h"
#include "Tools/ExitStatus.h"
#include "Tools/Log/DecoderLog.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <chrono>
#include <cmath>
#include <utility>

namespace velmora {

namespace {

using namespace std::chrono_literals;

/// How often the connection and the reader are checked, and programs.
constexpr auto checkInterval = 250ms;
constexpr auto programInterval = 50ms;

std::chrono::nanoseconds nanosecondsOf(double seconds) {
    return std::chrono::nanoseconds(static_cast<std::int64_t>(std::llround(seconds * 1e9)));
}

} // namespace

LiveEvents::LiveEvents(const EventsOptions& options, const RuleSet& rules, DecoderLines& lines,
                       ServiceClient& client, Output& output, MessageMask* mask)
    : _options(options), _lines(lines), _client(client), _output(output), _mask(mask),
      _listing(options, rules, output, [] { return SignalWatcher::hasSignal(); }),
      _link(client, lines,
            {[this](std::string_view technology, bool hasDecoder) { return learn(technology, hasDecoder); },
             [this](const Data& message) { take(message); }, [this] { endWithSource(); },
             [this](const std::string& text) {
                 report(text);
                 interrupt();
             },
             [](const std::string& text) { report(text); }, [](const std::string& text) { report(text); }}) {}

int LiveEvents::run() {
    const WorkContext context(serviceTitle, [this] {
        _listing.flush();
        _link.close();
    });
    const SignalWatcher signals([this](int) {
        if (EventPrograms* const programs = _listing.programs())
            programs->stop();
        end(true);
    });
    _link.start();
    if (_options.duration_seconds)
        _client.queue.after(nanosecondsOf(*_options.duration_seconds), [this] { end(true); });
    if (_options.timeout_seconds)
        _client.queue.after(nanosecondsOf(*_options.timeout_seconds), [this] { giveUp(); });
    const std::unique_ptr<Timer> checking = _client.queue.repeating(checkInterval, [this] { check(); });
    std::unique_ptr<Timer> programs;
    if (_listing.programs())
        programs = _client.queue.repeating(programInterval, [this] { _listing.programs()->check(); });
    const bool good = _client.loop.run() == ExitStatus::Done;
    _link.close();
    {
        const DecoderLog log(_lines);
        _listing.finish();
    }
    return _listing.status(good);
}

/// The service has named the technology. Returns whether to start streaming.
bool LiveEvents::learn(std::string_view technology, bool hasDecoder) {
    const DecoderLog log(_lines);
    const Result<TechnologyFeed*> feed = _listing.feed().of(std::string(technology));
    if (!feed || !hasDecoder) {
        report("the telephony service speaks " + std::string(shortTechnologyName(technology)) +
               ", which has no decoder here, wanted one of " + technologyNames());
        end(false);
        return false;
    }
    _technology = *feed;
    return true;
}

void LiveEvents::take(const Data& message) {
    if (!_technology)
        return;
    {
        const DecoderLog log(_lines);
        LoggedMessage logged;
        logged.time = _client.clock.now();
        logged.message = message;
        logged.number = ++_messages;
        std::optional<LoggedMessage> taken(std::move(logged));
        if (_mask)
            taken = _mask->mask(*std::move(taken), _technology->technology());
        const auto reason = taken ? _technology->decode(*taken, 0) : std::nullopt;
        if (reason)
            report("message " + std::to_string(_messages) + ": " + *reason);
    }
    if ((_options.count && _messages >= *_options.count) || _listing.isDone())
        end(true);
}

/// A number of messages that has not come by now does not come at all.
void LiveEvents::endWithSource() {
    if (!_options.count)
        return;
    report(std::string(serviceTitle) + "'s source has ended after " + std::to_string(_messages) + " of " +
           std::to_string(*_options.count) + " messages");
    end(false);
}

void LiveEvents::check() {
    if (_ended)
        return;
    if (_output.hasClosedReader() || _listing.isDone()) {
        end(true);
        return;
    }
    _link.check();
}

void LiveEvents::interrupt() {
    const DecoderLog log(_lines);
    _listing.feed().interrupt();
}

void LiveEvents::giveUp() {
    if (_ended || _technology)
        return;
    report(timeoutMessage(_link.problem(), *_options.timeout_seconds));
    end(false);
}

void LiveEvents::end(bool good) {
    _link.end();
    if (!std::exchange(_ended, true))
        _client.loop.quit(good ? ExitStatus::Done : ExitStatus::BadInput);
}

} // namespace velmora
