// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Telephony/TelephonydProcess.h"

#include "Platform/Linux/LoopTimer.h"
#include "Tests/Telephony/TelephonyTesting.h"

#include <fcntl.h>
#include <sys/wait.h>
#include <unistd.h>

#include <csignal>
#include <fstream>
#include <sstream>
#include <stdexcept>
#include <thread>
#include <utility>

namespace velmora {
namespace {

std::string contentOf(const std::filesystem::path& path) {
    std::ifstream file(path, std::ios::binary);
    std::ostringstream content;
    content << file.rdbuf();
    return content.str();
}

PortOptions optionsFor(const std::filesystem::path& directory) {
    PortOptions options;
    options.directory = directory;
    return options;
}

} // namespace

bool eventually(const std::function<bool()>& condition) {
    // The condition may change in another process, which does not wake this one.
    LoopTimer look([] {});
    look.startRepeating(std::chrono::milliseconds(1));
    return testLoop().runUntil(condition, std::chrono::seconds(30));
}

TestProcess::TestProcess(std::string program, std::vector<std::string> arguments,
                         const std::filesystem::path& directory) {
    static int number = 0;
    ++number;
    _output = directory / (".out." + std::to_string(number));
    _errors = directory / (".err." + std::to_string(number));
    std::vector<char*> words = {program.data()};
    for (std::string& argument : arguments)
        words.push_back(argument.data());
    words.push_back(nullptr);

    _id = ::fork();
    if (_id < 0)
        throw std::runtime_error("no process can be started");
    if (_id > 0)
        return;
    const int output = ::open(_output.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
    const int errors = ::open(_errors.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0600);
    ::dup2(output, STDOUT_FILENO);
    ::dup2(errors, STDERR_FILENO);
    ::setenv("VELMORA_PORT_DIR", directory.c_str(), 1);
    ::execv(program.c_str(), words.data());
    ::_exit(127);
}

TestProcess::~TestProcess() {
    if (_id <= 0)
        return;
    ::kill(_id, SIGKILL);
    ::waitpid(_id, nullptr, 0);
}

void TestProcess::signal(int number) {
    if (_id > 0)
        ::kill(_id, number);
}

std::optional<int> TestProcess::exitStatus() {
    const bool ended = _status || eventually([this] {
                           int status = 0;
                           if (::waitpid(_id, &status, WNOHANG) == 0)
                               return false;
                           _id = -1;
                           _status = WIFEXITED(status) ? WEXITSTATUS(status) : -1;
                           return true;
                       });
    return ended ? _status : std::nullopt;
}

std::string TestProcess::standardOutput() const {
    return contentOf(_output);
}

std::string TestProcess::standardError() const {
    return contentOf(_errors);
}

TestClient::TestClient(const std::filesystem::path& directory, const std::string& name)
    : _ports(optionsFor(directory)), _name(name) {
    auto created = _ports.createLocal(name, [this](LocalPort&, std::int32_t id, const Data& payload) {
        if (id == 0)
            messages.push_back(payload);
        return std::nullopt;
    });
    if (!created.port || created.alreadyExisted)
        throw std::runtime_error("cannot make the port " + name);
    _local = std::move(created.port);
    _local->attachToMainQueue();
}

bool TestClient::connect() {
    std::shared_ptr<VoxServerConnection> connection;
    if (!eventually([&] {
            connection = _service._VoxServerConnectionCreate([] {});
            return connection != nullptr;
        }))
        return false;
    const VoxError error =
        _service._VoxServerConnectionNetworkMonitorCreateLogChannel(*connection, _name, channel);
    if (error.code != 0 || channel.empty())
        return false;
    commands = _ports.createRemote(channel);
    return commands != nullptr;
}

std::string TestClient::technology() {
    using namespace std::chrono_literals;
    const auto answer = commands->sendRequest(0, plist({{"GetTechnology", "GetTechnology"}}), 5s, 5s, true);
    if (answer.status != PortStatus::Success || !answer.reply)
        return {};
    const auto reply = readPropertyList(answer.reply->bytes());
    if (!reply || !reply->asDictionary())
        return {};
    const std::string* technology = (*reply->asDictionary())["GetTechnology"].asString();
    return technology ? *technology : std::string();
}

bool TestClient::stream() {
    using namespace std::chrono_literals;
    return commands->sendRequest(0, plist({{"SetState", "Streaming"}}), 5s, 0s, false).status ==
           PortStatus::Success;
}

void TestClient::close() {
    _local->invalidate();
    commands.reset();
}

} // namespace velmora
