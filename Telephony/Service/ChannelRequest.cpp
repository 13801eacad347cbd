// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Telephony/Service/ChannelRequest.h"

#include "Platform/MessagePort.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"

#include <algorithm>

namespace velmora {

namespace {

bool hasControl(std::string_view text) {
    return std::any_of(text.begin(), text.end(), [](char c) {
        const auto byte = static_cast<unsigned char>(c);
        return byte < 0x20 || byte == 0x7F;
    });
}

} // namespace

Result<std::string> requestedPort(const Data& request) {
    const auto parsed = readPropertyList(request.bytes());
    if (!parsed)
        return Failure{"cannot read a request for a log channel: " + parsed.reason()};
    const Dictionary* dictionary = parsed->asDictionary();
    const std::string* name = dictionary ? (*dictionary)[vox::createLogChannelKey].asString() : nullptr;
    if (!name || name->empty())
        return Failure{"a request names no port, wanted {\"CreateLogChannel\": NAME}"};
    if (name->size() > maximumPortNameSize)
        return Failure{"a request names a port with " + std::to_string(name->size()) +
                       " bytes, wanted at most " + std::to_string(maximumPortNameSize)};
    if (hasControl(*name))
        return Failure{"a request names a port with control characters, wanted none"};
    return *name;
}

bool isServicePort(std::string_view name) {
    if (!name.starts_with(vox::serverPortName))
        return false;
    name.remove_prefix(vox::serverPortName.size());
    return name.empty() || name.front() == '.';
}

std::string quotedForLog(std::string_view text) {
    if (text.size() > maximumPortNameSize || hasControl(text))
        return "a text of " + std::to_string(text.size()) + " bytes";
    return '"' + std::string(text) + '"';
}

} // namespace velmora
