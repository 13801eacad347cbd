// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <optional>
#include <string>
#include <vector>

namespace velmora {

/// Which of a file's technologies a command takes.
struct TechnologyChoice {
    /// The short name as which the file's messages are taken; empty for the names in the file.
    std::string override;
    /// The index of the only technology whose messages are taken; absent for all.
    std::optional<std::uint32_t> only;

    /// What the name says that `--technology` gives, empty without it: of a file of several technologies it
    /// chooses one, of any other file it overrides the one that the file names. `technologies`: those that
    /// the file names. Fails for an unknown name, and where a file of several has no such technology.
    [[nodiscard]] static Result<TechnologyChoice> make(const std::string& name,
                                                       const std::vector<std::string>& technologies);

    /// The short name of the technology of that index.
    [[nodiscard]] std::string nameOf(std::uint32_t technology,
                                     const std::vector<std::string>& technologies) const;
};

/// The technologies that the file names: all of them where they have been found out beforehand, else those
/// that the reader has met so far.
[[nodiscard]] std::vector<std::string> knownTechnologies(const std::vector<std::string>& beforehand,
                                                         const MessageReader& reader);

/// Why a command that takes one technology refuses a file of several:
/// "holds Ostrel_GSM and Ostrel_LTE; --technology chooses one".
[[nodiscard]] std::string severalTechnologies(const std::vector<std::string>& technologies);

} // namespace velmora
