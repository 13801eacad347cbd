// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "PropertyLists/Value.h"
#include "Telephony/Drives/DriveIdentities.h"
#include "Telephony/Drives/LTE/LTENetwork.h"
#include "Telephony/Drives/RadioNetwork.h"
#include "Telephony/Drives/RecordBuilder.h"
#include "Telephony/Drives/UTRAN/UTRANNetwork.h"

#include <vector>

/// The records of the telephony service's extra stream, one function a code. They are the same in every
/// technology. The payload is a property list, in the binary form where `binary` says so and in XML
/// otherwise; its content is made here, so that writing it cannot fail because of the input.
namespace velmora::records {

/// ExtraCode::simFiles: the SIM's files, display-ready strings under the keys "kSimFile_...".
[[nodiscard]] RecordBuilder simFiles(const Dictionary& files, bool binary);
/// ExtraCode::cellInformation: the cell information array; dictionaries made by the functions below.
[[nodiscard]] RecordBuilder cellInformation(const std::vector<DictionaryRef>& cells, bool binary);
/// ExtraCode::packetDataContexts: one dictionary of display strings a packet-data context.
[[nodiscard]] RecordBuilder packetContexts(const std::vector<DictionaryRef>& contexts, bool binary);

/// Cells as the cell information array describes them.
[[nodiscard]] DictionaryRef gsmCellInformation(const GSMMeasurement& cell, bool serving);
[[nodiscard]] DictionaryRef umtsCellInformation(const UMTSMeasurement& cell, bool serving);
[[nodiscard]] DictionaryRef utranCellInformation(const UTRANMeasurement& cell, bool serving);
[[nodiscard]] DictionaryRef lteCellInformation(const LTEMeasurement& cell, bool serving);

/// The files of the first SIM, of network 001/01, that was last in this area.
[[nodiscard]] DictionaryRef testSIM(const CellArea& lastArea, const DriveIdentities& identities);
/// A context of the test network; `number` counts from 1.
[[nodiscard]] DictionaryRef testContext(int number, const DriveIdentities& identities);

} // namespace velmora::records
