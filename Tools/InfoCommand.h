#pragma once

#include <string>

namespace velmora {

class Output;

/// `velmora-log info`: what a recording holds, and what is wrong with it.
struct InfoOptions {
    std::string file;
};

/// The exit status.
[[nodiscard]] int runInfo(const InfoOptions& options, Output& output);

} // namespace velmora
