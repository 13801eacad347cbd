// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Picture/RadioPicture.h"
#include "Analysis/Rules/Evaluation/InputStore.h"

#include <cstdint>
#include <vector>

namespace velmora {

/// Passes what the picture has to the inputs that are roles, neighbours, and the state of the radio.
class RoleInputs {
public:
    /// Precondition: rules have added their inputs.
    explicit RoleInputs(const InputStore& inputs);

    /// To be called in every turn, with the picture that includes its message.
    void update(const RadioPicture& picture, InputStore& inputs);
    void clear() { _neighbours = 0; }

private:
    std::vector<std::uint32_t> _roles; ///< slots
    std::vector<std::uint32_t> _states;
    bool _hasNeighbours = false;
    std::size_t _neighbours = 0; ///< how many there were
    std::vector<Neighbour> _sameTechnology;
};

} // namespace velmora
