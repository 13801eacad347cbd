// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Record/Positions/RecordedPositions.h"

#include "Platform/Linux/Files/Files.h"
#include "Recording/Positions/NMEAWriter.h"
#include "Recording/Positions/TrackFile.h"
#include "Tools/Record/Positions/ModemFix.h"
#include "Tools/ServiceClient.h"

#include <utility>

#include <sys/stat.h>

namespace velmora {

Result<Done> RecordedPositions::load() {
    if (_choice.kind != PositionChoice::Kind::File)
        return Done{};
    struct stat status = {};
    if (::stat(_choice.path.c_str(), &status) == 0 && (S_ISCHR(status.st_mode) || S_ISFIFO(status.st_mode))) {
        _isDevice = true;
        return Done{};
    }
    const Result<Data> content = readFile(_choice.path, maximumTrackFile);
    if (!content)
        return Failure{_choice.path + ": " + content.reason()};
    const Bytes bytes = content->bytes();
    Result<std::vector<Fix>> fixes =
        fixesOfTrackFile({reinterpret_cast<const char*>(bytes.data()), bytes.size()});
    if (!fixes)
        return Failure{_choice.path + ": " + fixes.reason()};
    _fixes = *std::move(fixes);
    return Done{};
}

void RecordedPositions::start(ServiceClient& client, Events events) {
    _events = std::move(events);
    const Time begin = client.clock.now();
    while (_next < _fixes.size() && _fixes[_next].time < begin)
        ++_next;
    if (!_fixes.empty() && _next == _fixes.size())
        _events.news(_choice.path + ": all of its fixes are before now; recording goes on without positions");
    PositionSource::Events sourceEvents{
        [this, &client](std::string_view sentence) { _events.sentence(client.clock.now(), sentence); },
        [this](const std::string& text) { _events.news(text); }};
    if (_choice.kind == PositionChoice::Kind::GPSD)
        _source = makeGPSDSource(_choice, client.queue, std::move(sourceEvents));
    else if (_isDevice)
        _source = makeDeviceSource(_choice, std::move(sourceEvents));
}

void RecordedPositions::willRecord(Time time, Bytes message) {
    for (; _next < _fixes.size() && _fixes[_next].time <= time; ++_next)
        pass(_fixes[_next]);
    if (_choice.kind == PositionChoice::Kind::Modem)
        if (const std::optional<Fix> fix = fixOfModemMessage(message, time))
            pass(*fix);
}

void RecordedPositions::pass(const Fix& fix) {
    for (const std::string& sentence : nmeaSentences(fix))
        _events.sentence(fix.time, sentence);
}

} // namespace velmora
