// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/UTRAN/UTRANClassIndex.h"

namespace velmora {

UTRANClassIndex::UTRANClassIndex() {
    create(rrc_state);
    create(servingCellInfo);
    create(tdMeasurements);
    create(gsmMeasurements);
    create(trchMeasurements);
    create(cctrchMeasurements);
    create(pdpList);
    create(simInfo);
}

} // namespace velmora
