// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Modem/ModemClassIndex.h"

#include <memory>

namespace velmora {

ModemClassIndex::ModemClassIndex() {
    const auto payloads = std::make_shared<PayloadCache>();
    for (ModemSection* const section : std::initializer_list<ModemSection*>{
             servingCell.get(), secondaryCell.get(), neighborCells.get(), link.get(), registration.get(),
             contexts.get(), traffic.get(), sim.get(), simSlots.get(), equipment.get(), position.get()})
        section->sharePayloads(payloads);
}

} // namespace velmora
