// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Events/Programs/ProgramRun.h"

#include "Platform/Linux/Errno.h"
#include "Tools/Events/Programs/EventEnvironment.h"

#include <algorithm>
#include <cerrno>
#include <csignal>
#include <cstdint>

#include <fcntl.h>
#include <poll.h>
#include <spawn.h>
#include <sys/syscall.h>
#include <sys/wait.h>
#include <unistd.h>

namespace velmora {

namespace {

std::vector<char*> pointersTo(std::vector<std::string>& texts) {
    std::vector<char*> pointers;
    for (std::string& text : texts)
        pointers.push_back(text.data());
    pointers.push_back(nullptr);
    return pointers;
}

std::vector<std::string> environmentWith(const std::vector<std::string>& variables) {
    std::vector<std::string> all = variables;
    for (char** variable = environ; *variable; ++variable)
        if (!std::string_view(*variable).starts_with(eventVariablePrefix))
            all.emplace_back(*variable);
    return all;
}

/// How the program starts: in a group of its own, with the signals as they were before ours.
class Attributes {
public:
    Attributes() {
        ::posix_spawnattr_init(&_attributes);
        sigset_t none;
        ::sigemptyset(&none);
        ::posix_spawnattr_setsigmask(&_attributes, &none);
        sigset_t reset;
        ::sigemptyset(&reset);
        ::sigaddset(&reset, SIGPIPE);
        ::sigaddset(&reset, SIGXFSZ);
        ::posix_spawnattr_setsigdefault(&_attributes, &reset);
        ::posix_spawnattr_setpgroup(&_attributes, 0);
        ::posix_spawnattr_setflags(&_attributes,
                                   POSIX_SPAWN_SETPGROUP | POSIX_SPAWN_SETSIGMASK | POSIX_SPAWN_SETSIGDEF);
    }
    ~Attributes() { ::posix_spawnattr_destroy(&_attributes); }
    Attributes(const Attributes&) = delete;
    Attributes& operator=(const Attributes&) = delete;
    [[nodiscard]] const posix_spawnattr_t* get() const { return &_attributes; }

private:
    posix_spawnattr_t _attributes{};
};

/// What the program has open: the three standard descriptors alone.
class Descriptors {
public:
    Descriptors() {
        ::posix_spawn_file_actions_init(&_actions);
        ::posix_spawn_file_actions_addopen(&_actions, STDIN_FILENO, "/dev/null", O_RDONLY, 0);
        ::posix_spawn_file_actions_adddup2(&_actions, STDERR_FILENO, STDOUT_FILENO);
        ::posix_spawn_file_actions_addclosefrom_np(&_actions, STDERR_FILENO + 1);
    }
    ~Descriptors() { ::posix_spawn_file_actions_destroy(&_actions); }
    Descriptors(const Descriptors&) = delete;
    Descriptors& operator=(const Descriptors&) = delete;
    [[nodiscard]] const posix_spawn_file_actions_t* get() const { return &_actions; }

private:
    posix_spawn_file_actions_t _actions{};
};

} // namespace

Result<std::unique_ptr<ProgramRun>> ProgramRun::start(const std::vector<std::string>& arguments,
                                                      const std::vector<std::string>& environment,
                                                      std::chrono::nanoseconds limit) {
    std::vector<std::string> words = arguments;
    std::vector<std::string> variables = environmentWith(environment);
    const Attributes attributes;
    const Descriptors descriptors;
    pid_t id = -1;
    const int error = ::posix_spawnp(&id, words.front().c_str(), descriptors.get(), attributes.get(),
                                     pointersTo(words).data(), pointersTo(variables).data());
    if (error != 0)
        return Failure{"cannot run " + arguments.front() + ": " + errnoText(error)};
    // Without the library's function, which C++ cannot link against everywhere.
    FileDescriptor descriptor(static_cast<int>(::syscall(SYS_pidfd_open, id, 0)));
    return std::unique_ptr<ProgramRun>(new ProgramRun(id, std::move(descriptor), Clock::now() + limit));
}

ProgramRun::~ProgramRun() {
    if (_status)
        return;
    ::kill(-_id, SIGKILL);
    reap();
}

/// The process stays a zombie: its group's number cannot be another's before it is reaped.
bool ProgramRun::hasEnded() const {
    siginfo_t state = {};
    return ::waitid(P_PID, static_cast<id_t>(_id), &state, WEXITED | WNOHANG | WNOWAIT) == 0 &&
           state.si_pid == _id;
}

bool ProgramRun::check(Clock::time_point now) {
    if (_status)
        return true;
    if (hasEnded()) {
        // Others of the group may have survived the first signal.
        if (_killsAt)
            ::kill(-_id, SIGKILL);
        reap();
        return true;
    }
    if (_killsAt && now >= *_killsAt)
        ::kill(-_id, SIGKILL);
    else if (!_killsAt && now >= _end)
        terminate(now);
    return false;
}

void ProgramRun::terminate(Clock::time_point now) {
    if (_status || _killsAt)
        return;
    ::kill(-_id, SIGTERM);
    _killsAt = now + grace;
}

void ProgramRun::wait(Clock::time_point now) const {
    if (_status)
        return;
    using std::chrono::milliseconds;
    // Where the process has no descriptor it is asked now and then.
    const Clock::time_point deadline = _killsAt.value_or(_end);
    const auto rest = std::chrono::ceil<milliseconds>(deadline - now);
    const milliseconds most = _descriptor && deadline > now ? milliseconds(60'000) : milliseconds(10);
    pollfd watched{_descriptor.get(), POLLIN, 0};
    ::poll(&watched, 1, static_cast<int>(std::clamp(rest, milliseconds(1), most).count()));
}

void ProgramRun::reap() {
    int status = 0;
    while (::waitpid(_id, &status, 0) < 0 && errno == EINTR) {
    }
    _status = status;
}

std::string ProgramRun::problem() const {
    if (!_status)
        return {};
    if (WIFSIGNALED(*_status))
        return "was ended by signal " + std::to_string(WTERMSIG(*_status));
    const int status = WEXITSTATUS(*_status);
    return status == 0 ? std::string() : "ended with status " + std::to_string(status);
}

} // namespace velmora
