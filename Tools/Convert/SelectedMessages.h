// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Result.h"
#include "Recording/MessageReader.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Messages/MessageSelection.h"

#include <optional>
#include <string>

namespace velmora {

/// The selected messages of a file, the first of which has been read: a file may name its technology no
/// earlier than there.
struct SelectedMessages {
    MessageReader& reader;
    MessageFilter& filter;
    std::optional<LoggedMessage> next;
    std::string technology = {}; ///< the short name of the first, or of the chosen one
    bool isOne = false;          ///< by --technology

    /// `filter`: of the conversion's selection; it must outlive what is returned, as the reader. Fails where
    /// the technology is unknown, or the chosen one is not in the file.
    [[nodiscard]] static Result<SelectedMessages> begin(MessageReader& reader, const Conversion& conversion,
                                                        MessageFilter& filter);
    void advance();
};

} // namespace velmora
