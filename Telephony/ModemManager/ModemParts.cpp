// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/ModemManager/ModemParts.h"

#include "Telephony/ModemManager/Bus/ModemManagerNames.h"

#include <QString>

#include <utility>

namespace velmora {

ModemParts::ModemParts(MainQueue& queue, ModemFollower& follower, Changed changed, Refused refused)
    : _queue(queue), _follower(follower), _changed(std::move(changed)), _refused(std::move(refused)) {}

const ModemParts::Part* ModemParts::find(const std::string& path) const {
    const auto part = _parts.find(path);
    return part == _parts.end() ? nullptr : &part->second;
}

void ModemParts::follow(const std::map<std::string, std::string_view>& wanted) {
    std::erase_if(_parts, [&wanted](const auto& part) { return !wanted.contains(part.first); });
    for (const auto& [path, interface] : wanted)
        if (_parts.try_emplace(path, Part{interface, nullptr, {}}).second)
            read(path);
}

void ModemParts::read(const std::string& path) {
    const std::string_view interface = _parts[path].interface;
    const QVariantList arguments{
        QString::fromUtf8(interface.data(), static_cast<qsizetype>(interface.size()))};
    _follower.bus().call({.path = path,
                          .interface = mm::properties,
                          .method = "GetAll",
                          .arguments = arguments,
                          .timeout = timeout},
                         [this, path, weak = std::weak_ptr<bool>(_alive)](const BusReply& reply) {
                             if (weak.expired())
                                 return;
                             const auto part = _parts.find(path);
                             if (part == _parts.end())
                                 return;
                             if (reply.failed()) {
                                 part->second.reason = reply.reason();
                                 readAgainLater();
                                 return _refused(part->second, reply);
                             }
                             const DictionaryRef properties = reply.value.dictionaryRef();
                             part->second.reason.clear();
                             part->second.properties = properties ? properties : makeDictionary();
                             _changed(path, part->second, nullptr);
                         });
}

void ModemParts::readAgainLater() {
    if (std::exchange(_retrying, true))
        return;
    _queue.after(retryInterval, [this, weak = std::weak_ptr<bool>(_alive)] {
        if (weak.expired())
            return;
        _retrying = false;
        for (const auto& [path, part] : _parts)
            if (!part.properties)
                read(path);
    });
}

void ModemParts::objectChanged(const std::string& path, const Array& arguments) {
    const auto part = _parts.find(path);
    const std::string* interface = arguments.empty() ? nullptr : arguments[0].asString();
    if (part == _parts.end() || !part->second.properties || !interface ||
        *interface != part->second.interface)
        return;
    applyChange(*part->second.properties, arguments);
    static const Dictionary none;
    const Dictionary* changed = arguments.size() > 1 ? arguments[1].asDictionary() : nullptr;
    _changed(path, part->second, changed ? changed : &none);
}

} // namespace velmora
