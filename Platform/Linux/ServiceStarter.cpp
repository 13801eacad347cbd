// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Linux/ServiceStarter.h"

#include "Platform/Linux/Files/EnvironmentPath.h"
#include "Platform/Linux/Ports/LinuxRemotePort.h"
#include "Platform/SystemLog.h"
#include "Platform/TelephonyService.h"

#include <QProcess>
#include <QString>
#include <QStringList>

#include <sys/types.h>

#include <csignal>
#include <filesystem>
#include <memory>
#include <string>
#include <system_error>
#include <thread>
#include <utility>

namespace velmora {

namespace {

constexpr const char* programName = "velmora-telephonyd";
constexpr const char* unitName = "velmora-telephonyd.service";
constexpr const char* defaultSource = "modemmanager";
constexpr auto pollInterval = std::chrono::milliseconds(20);

/// The service's program beside the running one, else the one on the user's path.
std::string serviceProgram() {
    std::error_code error;
    const auto running = std::filesystem::read_symlink("/proc/self/exe", error);
    const auto beside = running.parent_path() / programName;
    return !error && std::filesystem::exists(beside, error) ? beside.string() : programName;
}

bool answers() {
    const auto port =
        LinuxRemotePort::connect(std::string(vox::serverPortName), {}, std::make_shared<PortPeers>());
    return port && *port;
}

/// Why no service could serve this user, whichever is started; empty where one could.
std::string obstacle() {
    const auto directory = PortOptions{}.openDirectory();
    return directory ? std::string() : directory.reason();
}

bool startUnit(std::chrono::milliseconds patience) {
    // The manager's answer comes when the service is ready. What it says against it is of no use to a user of
    // a system that has no service manager, and elsewhere it is in the manager's own log.
    QProcess manager;
    manager.setStandardOutputFile(QProcess::nullDevice());
    manager.setStandardErrorFile(QProcess::nullDevice());
    manager.start("systemctl", {"--user", "--quiet", "start", unitName});
    if (!manager.waitForFinished(static_cast<int>(patience.count()))) {
        manager.kill();
        manager.waitForFinished();
        return false;
    }
    if (manager.exitStatus() != QProcess::NormalExit || manager.exitCode() != 0 || !answers())
        return false;
    logFormat(LogPriority::Notice, "started %s", unitName);
    return true;
}

Result<Done> startProgram(std::chrono::milliseconds patience) {
    QProcess service;
    const std::string program = serviceProgram();
    service.setProgram(QString::fromStdString(program));
    // Named in full, so that the command can be tried manually.
    const std::string named = environmentPath("VELMORA_SOURCE").string();
    const std::string source = named.empty() ? defaultSource : named;
    service.setArguments({"--source", QString::fromStdString(source), "--log", "syslog"});
    const std::string command = std::string(program).append(" --source ").append(source);
    service.setStandardInputFile(QProcess::nullDevice());
    service.setStandardOutputFile(QProcess::nullDevice());
    service.setStandardErrorFile(QProcess::nullDevice());
    qint64 id = 0;
    if (!service.startDetached(&id))
        return Failure{command + " cannot be started: " + service.errorString().toStdString()};
    logFormat(LogPriority::Notice, "started %s as process %lld", command.c_str(), static_cast<long long>(id));
    const auto deadline = std::chrono::steady_clock::now() + patience;
    while (!answers()) {
        if (::kill(static_cast<pid_t>(id), 0) != 0)
            return Failure{command + " has ended, wanted a service that answers"};
        if (std::chrono::steady_clock::now() >= deadline)
            return Failure{command + " does not answer"};
        std::this_thread::sleep_for(pollInterval);
    }
    return Done();
}

} // namespace

Result<Done> startTelephonyService(std::chrono::milliseconds patience) {
    if (std::string reason = obstacle(); !reason.empty())
        return Failure{std::move(reason)};
    if (answers())
        return Done();
    // A unit's ports are in the standard directory; where another one is named it would not be found.
    if (environmentPath("VELMORA_PORT_DIR").empty() && startUnit(patience))
        return Done();
    return startProgram(patience);
}

} // namespace velmora
