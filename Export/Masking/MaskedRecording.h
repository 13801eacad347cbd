// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Sealing/MaskSeal.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Recording/Files/OutputFile.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// Writes masked messages as a recording that is made anew, so that nothing of another file's options,
/// comments and unknown blocks gets into it: one section, an interface for each technology, the messages, the
/// seal. Main thread only.
class MaskedRecording {
public:
    /// Failures name the file `name`. `seal`: without a digest.
    MaskedRecording(std::unique_ptr<OutputFile> file, std::string name, MaskSeal seal);

    /// `technology`: a short name. Precondition: the message is not above `maximumMessageSize`.
    Result<Done> add(Time time, Bytes message, std::string_view technology);
    /// Adds a sentence of the receiver of positions; nothing before the first message.
    void addSentence(Time time, std::string_view sentence);
    /// Writes what is left. `technology`: of the interface where there was no message.
    Result<Done> finish(std::string_view technology);

private:
    [[nodiscard]] std::uint32_t interfaceOf(std::string_view technology);
    Result<Done> flush();

    std::unique_ptr<OutputFile> _file;
    std::string _name;
    MessageDigest _sentences;
    MaskSeal _seal;
    MessageDigest _digest;
    std::vector<std::string> _interfaces;
    std::vector<std::uint8_t> _buffer;
};

} // namespace velmora
