#pragma once

#include "Platform/Result.h"
#include "Recording/MessageReader.h"

#include <memory>
#include <string>

namespace velmora {

/// Opens a file of log messages, telling its form by what it begins with, never by its name. "-" is standard
/// input. The reason does not repeat the path.
Result<std::unique_ptr<MessageReader>> openMessages(const std::string& path);

} // namespace velmora
