// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Tools/ToolProcess.h"

#include <algorithm>
#include <cerrno>
#include <chrono>
#include <csignal>
#include <cstdlib>
#include <sstream>
#include <stdexcept>

#include <fcntl.h>
#include <sys/ioctl.h>
#include <sys/mman.h>
#include <sys/resource.h>
#include <sys/wait.h>
#include <unistd.h>

namespace velmora {

namespace {

struct Ends {
    FileDescriptor ours;
    FileDescriptor theirs;
};

Ends openPipe() {
    int ends[2];
    if (::pipe2(ends, O_CLOEXEC) != 0)
        throw std::runtime_error("no pipe");
    return {FileDescriptor(ends[0]), FileDescriptor(ends[1])};
}

Ends openTerminal() {
    FileDescriptor ours(::posix_openpt(O_RDWR | O_NOCTTY | O_CLOEXEC));
    if (ours.get() < 0 || ::grantpt(ours.get()) != 0 || ::unlockpt(ours.get()) != 0)
        throw std::runtime_error("no terminal");
    char name[64];
    if (::ptsname_r(ours.get(), name, sizeof name) != 0)
        throw std::runtime_error("no terminal name");
    FileDescriptor theirs(::open(name, O_RDWR | O_NOCTTY | O_CLOEXEC));
    return {std::move(ours), std::move(theirs)};
}

/// An unnamed file with the text, from its beginning.
FileDescriptor fileWith(const std::string& text) {
    FileDescriptor file(::memfd_create("input", MFD_CLOEXEC));
    if (::write(file.get(), text.data(), text.size()) != static_cast<ssize_t>(text.size()) ||
        ::lseek(file.get(), 0, SEEK_SET) != 0)
        throw std::runtime_error("no input file");
    return file;
}

} // namespace

bool eventually(const std::function<bool()>& condition) {
    return testLoop().runUntil(condition, std::chrono::seconds(40));
}

ToolProcess::ToolProcess(const Setup& setup, std::string program) {
    if (program.empty())
        program = VELMORA_BUILD_DIR "/velmora-log";
    Ends output = setup.onTerminal ? openTerminal() : openPipe();
    if (setup.onTerminal) {
        const winsize window = {12, 60, 0, 0};
        ::ioctl(output.ours.get(), TIOCSWINSZ, &window);
    }
    if (setup.outputFile)
        output.theirs =
            FileDescriptor(::open(setup.outputFile->c_str(), O_WRONLY | O_CREAT | O_CLOEXEC, 0600));
    Ends errors = setup.errorsOnTerminal && !setup.onTerminal ? openTerminal() : openPipe();
    const FileDescriptor input = fileWith(setup.input.value_or(""));

    std::vector<std::string> words = {program};
    words.insert(words.end(), setup.arguments.begin(), setup.arguments.end());
    std::vector<char*> arguments;
    for (std::string& word : words)
        arguments.push_back(word.data());
    arguments.push_back(nullptr);

    _id = ::fork();
    if (_id < 0)
        throw std::runtime_error("no process");
    if (_id == 0) {
        for (const auto& [name, value] : setup.environment)
            ::setenv(name.c_str(), value.c_str(), 1);
        ::signal(SIGPIPE, SIG_DFL);
        if (setup.onTerminal) {
            ::setsid();
            ::ioctl(output.theirs.get(), TIOCSCTTY, 0);
        }
        ::dup2(setup.onTerminal ? output.theirs.get() : input.get(), STDIN_FILENO);
        ::dup2(output.theirs.get(), STDOUT_FILENO);
        ::dup2(setup.errorsOnTerminal && setup.onTerminal ? output.theirs.get() : errors.theirs.get(),
               STDERR_FILENO);
        ::execv(program.c_str(), arguments.data());
        ::_exit(127);
    }
    _output.end = std::move(output.ours);
    _errors.end = std::move(errors.ours);
    output.theirs.reset();
    errors.theirs.reset();
    _output.start();
    _errors.start();
}

ToolProcess::~ToolProcess() {
    if (_status)
        return;
    ::kill(_id, SIGKILL);
    ::waitpid(_id, nullptr, 0);
}

void ToolProcess::Stream::start() {
    watch = std::make_unique<SocketWatch>(end.get(), SocketWatch::For::Reading, [this] { read(); });
}

void ToolProcess::Stream::read() {
    char bytes[4096];
    const ssize_t count = ::read(end.get(), bytes, sizeof bytes);
    if (count > 0) {
        text.append(bytes, static_cast<std::size_t>(count));
    } else if (count == 0 || errno != EINTR) {
        ended = true; // a terminal ends with an error
        watch.reset();
    }
}

std::optional<std::size_t> ToolProcess::waitFor(const std::string& text, std::size_t from) {
    std::size_t found = std::string::npos;
    if (!eventually([&] {
            found = _output.text.find(text, from);
            return found != std::string::npos || (_output.ended && _errors.ended);
        }) ||
        found == std::string::npos)
        return std::nullopt;
    return found + text.size();
}

std::optional<int> ToolProcess::exitStatus() {
    if (!_status) {
        if (!eventually([this] { return _output.ended && _errors.ended; }))
            return std::nullopt;
        int status = 0;
        ::waitpid(_id, &status, 0);
        _status = WIFEXITED(status) ? WEXITSTATUS(status) : 128 + WTERMSIG(status);
    }
    return _status;
}

bool ToolProcess::waitForError(const std::string& text) {
    const auto said = [&] { return _errors.text.find(text) != std::string::npos; };
    return eventually([&] { return said() || (_output.ended && _errors.ended); }) && said();
}

void ToolProcess::limitFileSize(std::optional<std::uint64_t> bytes) const {
    rlimit limit = {};
    if (::getrlimit(RLIMIT_FSIZE, &limit) != 0)
        throw std::runtime_error("no limit");
    if (bytes)
        limit.rlim_cur = *bytes;
    if (::prlimit(_id, RLIMIT_FSIZE, &limit, nullptr) != 0)
        throw std::runtime_error("not limited");
}

void ToolProcess::signal(int number) const {
    ::kill(_id, number);
}

void ToolProcess::type(const std::string& keys) const {
    if (::write(_output.end.get(), keys.data(), keys.size()) != static_cast<ssize_t>(keys.size()))
        throw std::runtime_error("nothing was typed");
}

void ToolProcess::resize(unsigned short columns, unsigned short rows) const {
    const winsize window = {rows, columns, 0, 0};
    ::ioctl(_output.end.get(), TIOCSWINSZ, &window);
}

void ToolProcess::stopReading() {
    _output.ended = true;
    _output.watch.reset();
    _output.end.reset();
}

std::string ownMessages(const std::string& errors) {
    std::istringstream lines(errors);
    std::string words;
    for (std::string line; std::getline(lines, line);)
        if (!line.starts_with('<') && !line.starts_with("Deallocing "))
            words += line + "\n";
    return words;
}

} // namespace velmora
