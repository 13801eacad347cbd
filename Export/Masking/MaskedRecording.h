// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/Sealing/MaskSeal.h"
#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Recording/Files/OutputFile.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <memory>
#include <optional>
#include <span>
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

    /// `technology`: a short name; `comments`: on the message, which are not masked and which the seal does
    /// not cover. Precondition: the message is not above `maximumMessageSize`.
    Result<Done> add(Time time, Bytes message, std::string_view technology,
                     std::span<const std::string> comments = {});
    /// Adds the sentences of the receiver of positions that the reader passes on from now on and that the
    /// seal's level keeps; nothing before the first message. The reader may not be read any more afterwards.
    void addSentencesOf(MessageReader& reader);
    /// Writes what is left. `technology`: of the interface where there was no message.
    Result<Done> finish(std::string_view technology);

private:
    void addSentence(Time time, std::string_view sentence);
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
