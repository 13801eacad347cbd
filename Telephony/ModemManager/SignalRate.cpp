// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/SignalRate.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"

#include <utility>

namespace velmora {
namespace {

std::uint32_t publishedRate(const Modem& modem) {
    const std::int64_t* rate = modem[mm::signal]["Rate"].asInteger();
    return rate && *rate > 0 && *rate <= 0xFFFF ? static_cast<std::uint32_t>(*rate) : 0;
}

BusCall setup(const std::string& path, std::uint32_t rate) {
    return {.path = path, .interface = mm::signal, .method = "Setup", .arguments = {rate}};
}

} // namespace

SignalRate::SignalRate(MainQueue& queue, ModemFollower& follower, const RateMemory& memory, std::string path,
                       Refused refused)
    : _queue(queue), _follower(follower), _memory(memory), _path(std::move(path)),
      _refused(std::move(refused)) {}

SignalRate::~SignalRate() {
    if (_earlier)
        _follower.bus().send(setup(_path, *_earlier));
    release();
}

void SignalRate::release() {
    if (std::exchange(_earlier, std::nullopt))
        _memory.clear();
}

void SignalRate::modemChanged(bool again) {
    const Modem* modem = _follower.modem();
    const bool isThere = modem && modem->path == _path && modem->has(mm::signal);
    if (again || !isThere)
        _wasRefused = false;
    if (!std::exchange(_wasThere, isThere))
        _pausing = false;
    if (!isThere)
        return release();
    const std::uint32_t published = publishedRate(*modem);
    if (published != std::exchange(_seen, published) && published != rate)
        release(); // another program has set it
    const bool isEnough = published != 0 && published <= rate;
    if (!isEnough && !_earlier && !_wasRefused && !_pausing)
        set(published);
}

void SignalRate::set(std::uint32_t earlier) {
    _earlier = earlier;
    _pausing = true;
    _memory.write({_follower.owner(), _path, rate, earlier});
    const std::weak_ptr<bool> alive = _alive;
    _queue.after(pause, [this, alive] {
        if (alive.expired())
            return;
        _pausing = false;
        modemChanged(false);
    });
    _follower.bus().call(setup(_path, rate), [this, alive](const BusReply& reply) {
        if (alive.expired())
            return;
        if (!reply.failed())
            return _follower.faults().clear("levels");
        _wasRefused = true;
        release();
        _refused(reply);
    });
}

void SignalRate::restoreRemembered(ModemFollower& follower, const RateMemory& memory) {
    const auto remembered = memory.read();
    if (!remembered)
        return;
    const Modem* modem = follower.modemAt(remembered->modem);
    if (modem && remembered->owner == follower.owner() && publishedRate(*modem) == remembered->ours)
        follower.bus().send(setup(remembered->modem, remembered->earlier));
    memory.clear();
}

} // namespace velmora
