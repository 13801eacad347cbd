// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemCalls.h"

#include <utility>

namespace velmora {

ModemCalls::ModemCalls(MainQueue& queue, ModemFollower& follower)
    : _queue(queue), _follower(follower), _path(follower.modem()->path),
      _name("modem " + std::to_string(follower.modem()->index)) {}

void ModemCalls::after(std::chrono::nanoseconds delay, std::function<void()> task) {
    _queue.after(delay, [weak = std::weak_ptr<bool>(_alive), action = std::move(task)] {
        if (!weak.expired())
            action();
    });
}

void ModemCalls::call(const BusCall& call, std::function<void(const BusReply&)> answered) {
    _follower.bus().call(
        call, [weak = std::weak_ptr<bool>(_alive), action = std::move(answered)](const BusReply& reply) {
            if (!weak.expired())
                action(reply);
        });
}

void ModemCalls::reportFault(std::string_view subject, const BusReply& reply, std::string_view what) {
    const std::string end = std::string(what) + " (" + reply.reason() + ')';
    FaultLog& faults = _follower.faults();
    if (reply.isUnsupported())
        faults.report(subject, _name + " does not support " + end);
    else if (reply.isDenied())
        faults.report(subject, "no permission to ask " + _name + " for " + end +
                                   (subject == cellSubject
                                        ? "; velmora-modemmanager.conf allows it, see velmora-telephonyd(1)"
                                        : ""));
    else
        faults.report(subject, _name + " does not give " + end);
}

} // namespace velmora
