// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Jobs/Spool.h"

#include "Tools/Decode/Jobs/SpoolBudget.h"
#include "Tools/Output.h"

#include <cerrno>
#include <cstdlib>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace velmora {

Spool::Spool(SpoolBudget& budget)
    : _budget(budget), _file(::open(directory(), O_TMPFILE | O_RDWR | O_CLOEXEC, 0600)) {}

const char* Spool::directory() {
    const char* const chosen = std::getenv("TMPDIR");
    return chosen && *chosen ? chosen : "/tmp";
}

std::string_view Spool::append(std::string_view text) {
    if (!_file)
        return text;
    std::uint64_t room = _budget.take(text.size());
    while (room > 0) {
        const ssize_t count = ::write(_file.get(), text.data(), room);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            break; // a full disk only keeps the job from going ahead
        text.remove_prefix(static_cast<std::size_t>(count));
        room -= static_cast<std::uint64_t>(count);
    }
    _budget.giveBack(room);
    return text;
}

bool Spool::moveTo(Output& output) {
    const std::uint64_t end = size();
    const std::uint64_t from = _moved;
    _moved = end;
    return from == end || output.putFile(_file.get(), from, end - from);
}

void Spool::discard() {
    _budget.giveBack(size());
    _file.reset();
    _moved = 0;
}

std::uint64_t Spool::size() const {
    struct stat status = {};
    return _file && ::fstat(_file.get(), &status) == 0 ? static_cast<std::uint64_t>(status.st_size) : 0;
}

} // namespace velmora
