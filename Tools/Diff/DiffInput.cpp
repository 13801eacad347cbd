// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Diff/DiffInput.h"

#include <filesystem>
#include <system_error>

namespace velmora {

DiffInput DiffInput::of(const std::string& text) {
    DiffInput input;
    input._text = text;
    input.file = text;
    std::error_code error;
    const std::size_t at = text.rfind('@');
    if (at == std::string::npos || at == 0 || std::filesystem::exists(text, error))
        return input;
    if (const Result<TimeBound> time = readTimeBound(std::string_view(text).substr(at + 1))) {
        input.file = text.substr(0, at);
        input.time = *time;
    }
    return input;
}

} // namespace velmora
