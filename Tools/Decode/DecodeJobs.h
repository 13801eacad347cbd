// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstddef>
#include <functional>

namespace velmora {

class Output;

/// Does one piece of work into an output. Whether its input was good. May end the process, as decoders do.
using DecodeJob = std::function<bool(std::size_t index, Output& output)>;

/// Does `count` pieces of work, up to `jobs` at a time, each in a process of its own, since nothing of the
/// decoders is made for several threads. Output and standard error are as if they had been done one after the
/// other: what a later one writes waits, in a file without a name in the directory of temporary files, of at
/// most 256 MiB a process, and behind that in the process itself. A piece that ends its process ends those
/// behind it, whose output is dropped. Whether all went well. Precondition: no other thread runs.
[[nodiscard]] bool runDecodeJobs(std::size_t count, std::size_t jobs, const DecodeJob& job, Output& output);

} // namespace velmora
