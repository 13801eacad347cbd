// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Linux/Files/FileDescriptor.h"
#include "Tools/OutputDetour.h"

namespace velmora {

class Spool;

/// In the process of a job that is not first in line: its output goes to a spool until the process that
/// started it says that it is first. It waits then until the spool has been written, and writes by itself.
class JobTurn final : public OutputDetour {
public:
    /// The job's end of a pair of sockets. `spool` must outlive it.
    JobTurn(FileDescriptor channel, Spool& spool);

    [[nodiscard]] std::string_view take(std::string_view text) override;
    [[nodiscard]] bool isFirst() override;

private:
    FileDescriptor _channel; ///< none once the output is this process's
    Spool& _spool;
    bool _isFirst = false;
};

} // namespace velmora
