// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "App/Playback/PlaybackController.h"

#include "App/Playback/MomentText.h"
#include "App/Playback/PlaybackNotice.h"
#include "App/Playback/PlaybackSpeeds.h"
#include "App/Playback/ShownPosition.h"
#include "App/Playback/TimedSteps.h"
#include "Platform/PrintableText.h"
#include "Platform/TelephonyService.h"

#include <chrono>
#include <cmath>
#include <limits>
#include <utility>

namespace velmora {

namespace {

using namespace std::chrono_literals;

constexpr auto playInterval = 50ms;
constexpr auto readInterval = 2ms;
/// Between two looks at the time.
constexpr std::uint64_t messagesAtOnce = 200;

} // namespace

Result<std::unique_ptr<PlaybackController>> PlaybackController::open(const ModelPlatform& platform,
                                                                     const std::string& path,
                                                                     const std::string& technology,
                                                                     Host host) {
    std::unique_ptr<PlaybackController> made(
        new PlaybackController(platform, path, technology, std::move(host)));
    if (const Result<Done> loaded = made->load(); !loaded)
        return Failure{loaded.reason()};
    const bool isSnapshot = made->_file->reader().form() == "snapshot";
    if (isSnapshot)
        made->_wanted = std::numeric_limits<std::uint64_t>::max();
    made->readOn(); // so that the front is known
    if (!isSnapshot)
        made->play();
    return made;
}

PlaybackController::PlaybackController(const ModelPlatform& platform, std::string path,
                                       std::string technology, Host host)
    : _platform(platform), _path(std::move(path)), _technology(std::move(technology)), _host(std::move(host)),
      _bar(playbackSpeedTitles()),
      _drive(_platform.clock, _host.rules,
             {[this](Time time) { seekToTime(time + 1ns); }, [this] { static_cast<void>(reopen()); },
              [this] { return progress(); }}) {
    PlaybackBar::Actions actions;
    actions.command = [this](PlaybackBar::Command command) { run(command); };
    actions.seek = [this](double part) {
        const std::optional<Time> first = _index->first();
        if (!first)
            return;
        const auto whole = static_cast<double>((*_index->last() - *first).count());
        if (part >= 1)
            seekToMessage(_index->messages());
        else
            seekToTime(*first + std::chrono::nanoseconds(std::llround(whole * part)));
    };
    actions.typed = [this](const std::string& text) {
        const std::optional<Time> time = momentNamed(text, shownTime(), _platform.clock);
        if (time)
            seekToTime(*time);
        return time.has_value();
    };
    actions.speed = [this](std::size_t index) { setSpeed(index); };
    _bar.setActions(std::move(actions));
}

PlaybackController::~PlaybackController() = default;

Result<Done> PlaybackController::load() {
    Result<std::unique_ptr<PlayedFile>> file = PlayedFile::open(_path);
    if (!file)
        return Failure{file.reason()};
    Result<std::unique_ptr<RecordingIndex>> index = RecordingIndex::make(**file, _technology, _host.masking);
    if (!index)
        return Failure{index.reason()};
    Result<std::unique_ptr<Player>> player = Player::make(**file, **index, _host.masking);
    if (!player)
        return Failure{player.reason()};
    // What refers to another goes first.
    _drive.setPlayer(nullptr, nullptr);
    _player = *std::move(player);
    _index = *std::move(index);
    _file = *std::move(file);
    _drive.setPlayer(_index.get(), _player.get());
    _technology = _index->technology();
    _tree.clear();
    _reading = _platform.queue.repeating(readInterval, [this] { readOn(); });
    showBar();
    return Done{};
}

Result<Done> PlaybackController::reopen() {
    _wanted = _wanted.value_or(_player->position());
    pause();
    if (const Result<Done> loaded = load(); !loaded)
        return loaded;
    readOn();
    return Done{};
}

void PlaybackController::readOn() {
    if (_index->isComplete())
        return;
    static_cast<void>(inTime([this] { return !_index->read(messagesAtOnce); }));
    _drive.changed();
    if (_wanted && (_index->isComplete() || _index->messages() >= *_wanted)) {
        _player->seekToMessage(*std::exchange(_wanted, std::nullopt));
        moved();
    }
    if (_index->isComplete()) {
        _reading.reset();
        _host.noticeChanged();
    }
    showBar();
}

void PlaybackController::play() {
    if (_playing)
        return;
    if (_index->isComplete() && !_player->next())
        _player->seekToMessage(0); // once more
    _playing = _platform.queue.repeating(playInterval, [this] { playOn(); });
    moved();
}

void PlaybackController::pause() {
    _playing.reset();
    showBar();
}

void PlaybackController::playOn() {
    const Time now = _platform.clock.now();
    const Time target = _pace.dueAt(now);
    const std::uint64_t before = _player->position();
    const bool isThere = inTime([&] { return _player->playTo(target, messagesAtOnce); });
    // A drive that is played faster than it can be decoded is played as fast as it can.
    if (!isThere || (!_player->next() && !_index->isComplete()))
        _pace.beginAt(shownTime(), now);
    if (!_player->next() && _index->isComplete())
        _playing.reset();
    if (_player->position() == before) {
        showBar();
        return;
    }
    checkFile();
    _tree.clear();
    _drive.changed();
    showBar();
    _host.displayChanged();
}

void PlaybackController::moved() {
    if (!std::exchange(_event, {}).empty())
        _host.noticeChanged();
    _pace.beginAt(shownTime(), _platform.clock.now());
    checkFile();
    _tree.clear();
    _drive.changed();
    showBar();
    _host.displayChanged();
}

void PlaybackController::seekToMessage(std::uint64_t messages) {
    _wanted.reset();
    _player->seekToMessage(messages);
    moved();
}

void PlaybackController::seekToTime(Time time) {
    _wanted.reset();
    _player->seekToTime(time);
    moved();
}

void PlaybackController::run(PlaybackBar::Command command) {
    using Command = PlaybackBar::Command;
    if (command == Command::PlayOrPause) {
        if (isPlaying())
            pause();
        else
            play();
        return;
    }
    pause();
    const std::uint64_t position = _player->position();
    switch (command) {
    case Command::EarlierMessage: seekToMessage(position == 0 ? 0 : position - 1); break;
    case Command::NextMessage: seekToMessage(position + 1); break;
    case Command::EarlierRefresh:
        _player->stepToEarlierRefresh();
        moved();
        break;
    case Command::NextRefresh:
        _player->stepToNextRefresh();
        moved();
        break;
    case Command::EarlierEvent: seekToEvent(_drive.recorded().before(shownTime())); break;
    case Command::NextEvent:
        // At the front, those at the time of the first message are still to come.
        seekToEvent(_drive.recorded().after(position == 0 ? shownTime() - 1ns : shownTime()));
        break;
    case Command::PlayOrPause: break;
    }
}

void PlaybackController::seekToEvent(const Event* event) {
    if (!event)
        return;
    std::string text = event->kind + ": " + event->text;
    // After the messages of that time.
    seekToTime(event->time + 1ns);
    _event = std::move(text);
    _host.noticeChanged();
}

void PlaybackController::setSpeed(std::size_t index) {
    _pace.setSpeed(index);
    moved();
}

Time PlaybackController::shownTime() const {
    return velmora::shownTime(*_index, *_player);
}

void PlaybackController::showBar() {
    PlaybackBar::Shown shown = shownPosition(*_index, *_player, _platform.clock);
    shown.isPlaying = isPlaying();
    shown.speed = _pace.speed();
    _bar.show(shown);
}

void PlaybackController::checkFile() {
    if (std::string change = _file->change(); change != _change) {
        _change = std::move(change);
        _host.noticeChanged();
    }
}

NodeRef PlaybackController::topLevelNodes() {
    return _tree.root([this] { return _player->display(); });
}

NodeRef PlaybackController::nodeAtPath(const std::string& path) {
    return topLevelNodes() ? _tree.at(path) : nullptr;
}

std::string PlaybackController::progress() const {
    if (_index->isComplete())
        return {};
    return "reading: " + std::to_string(static_cast<int>(_file->progress() * 100)) + " %";
}

Notice PlaybackController::notice() {
    const std::string other = otherTechnology(*_file, *_index);
    Notice notice{playbackNotice(*_file, *_index, *_player, _change), {}, {}};
    if (!_event.empty())
        notice.text += (notice.text.empty() ? "" : " ") + printable(_event);
    if (!other.empty()) {
        notice.title = "Show " + technologyTitle(other);
        notice.action = [this] { showOtherTechnology(); };
    }
    return notice;
}

void PlaybackController::showOtherTechnology() {
    const Time moment = shownTime();
    const std::string earlier = std::exchange(_technology, otherTechnology(*_file, *_index));
    pause();
    if (!load()) {
        _technology = earlier;
        return;
    }
    while (_index->read(messagesAtOnce) && _index->last() < moment) {
    }
    seekToTime(moment);
    _host.noticeChanged();
}

} // namespace velmora
