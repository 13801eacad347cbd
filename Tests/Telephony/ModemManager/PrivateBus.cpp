// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/ModemManager/PrivateBus.h"

#include <csignal>
#include <fstream>
#include <stdexcept>

namespace velmora {

PrivateBus::PrivateBus(const std::string& rules) : _address("unix:path=" + (_directory / "bus").string()) {
    std::ofstream configuration(_directory / "bus.conf");
    configuration << "<!DOCTYPE busconfig PUBLIC \"-//freedesktop//DTD D-Bus Bus Configuration 1.0//EN\"\n"
                     " \"http://www.freedesktop.org/standards/dbus/1.0/busconfig.dtd\">\n"
                     "<busconfig>\n<type>session</type>\n<listen>"
                  << _address
                  << "</listen>\n<policy context=\"default\">\n"
                     "<allow send_destination=\"*\" eavesdrop=\"true\"/>\n<allow eavesdrop=\"true\"/>\n"
                     "<allow own=\"*\"/>\n"
                  << rules << "\n</policy>\n</busconfig>\n";
    configuration.close();
    start();
}

void PrivateBus::start() {
    _process = std::make_unique<TestProcess>(
        "/usr/bin/dbus-daemon",
        std::vector<std::string>{"--config-file=" + (_directory / "bus.conf").string(), "--nofork",
                                 "--print-address"},
        _directory.path());
    // The address is written once the socket is there.
    if (!eventually([this] { return _process->standardOutput().ends_with('\n'); }))
        throw std::runtime_error("no bus: " + _process->standardError());
}

void PrivateBus::stop() {
    _process->signal(SIGTERM);
    static_cast<void>(_process->exitStatus());
}

} // namespace velmora
