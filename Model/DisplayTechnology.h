// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"

#include <string>
#include <string_view>

namespace velmora {

/// Which technology's display a state has. The state outlives decoders: after a change of technology its
/// display stays that of the earlier one, unless the new decoder replaces it.
class DisplayTechnology {
public:
    /// A decoder of that technology takes the state over, which is as the earlier one has left it.
    void setDecoder(std::string_view technology, const Dictionary& state);

    /// The technology of the decoder; empty before the first.
    [[nodiscard]] const std::string& ofDecoder() const { return _technology; }
    /// Empty where there is no display.
    [[nodiscard]] std::string ofDisplay(const Dictionary& state) const;

private:
    std::string _technology;
    /// The display that was there when the decoder was chosen.
    Value _earlierDisplay;
    std::string _earlierTechnology;
};

} // namespace velmora
