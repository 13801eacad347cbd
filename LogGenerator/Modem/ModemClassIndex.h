// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Modem/Cells/ModemNeighborCells.h"
#include "LogGenerator/Modem/Cells/ModemSecondaryCell.h"
#include "LogGenerator/Modem/Cells/ModemServingCell.h"
#include "LogGenerator/Modem/ModemContexts.h"
#include "LogGenerator/Modem/ModemEquipment.h"
#include "LogGenerator/Modem/ModemLink.h"
#include "LogGenerator/Modem/ModemPosition.h"
#include "LogGenerator/Modem/ModemRegistration.h"
#include "LogGenerator/Modem/ModemSIM.h"
#include "LogGenerator/Modem/ModemSIMSlots.h"
#include "LogGenerator/Modem/ModemTraffic.h"

namespace velmora {

/// The sections of the technology Modem. The fields are the list of sections: see ClassIndex.
class ModemClassIndex final : public ClassIndex {
public:
    /// Lets the sections read each message once.
    ModemClassIndex();

    Held<ModemServingCell> servingCell{*this};
    Held<ModemSecondaryCell> secondaryCell{*this};
    Held<ModemNeighborCells> neighborCells{*this};
    Held<ModemLink> link{*this};
    Held<ModemRegistration> registration{*this};
    Held<ModemContexts> contexts{*this};
    Held<ModemTraffic> traffic{*this};
    Held<ModemSIM> sim{*this};
    Held<ModemSIMSlots> simSlots{*this};
    Held<ModemEquipment> equipment{*this};
    Held<ModemPosition> position{*this};
};

} // namespace velmora
