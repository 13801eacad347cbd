// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Decoding.h"

#include "Tools/Decode/FileDecoding.h"
#include "Tools/Report.h"

namespace velmora {

Result<DecodedFile> decodeMessages(MessageReader& reader, const DecodingRequest& request,
                                   WorkContext& context, DecodingObserver& observer) {
    return FileDecoding(reader, request, context, observer).run();
}

bool reportLosses(const MessageReader& reader, const std::string& title) {
    for (const Loss& loss : reader.losses())
        report(positionInFile(title, loss.recordNumber, loss.offset) + ": " + loss.reason);
    const MessageReader::LossTotals& totals = reader.lossTotals();
    if (totals.losses > reader.losses().size())
        report(title + ": and " + std::to_string(totals.losses - reader.losses().size()) + " more, " +
               std::to_string(totals.bytes) + " bytes left out in all");
    if (reader.failure())
        report(title + ": " + reader.failure()->reason);
    return totals.losses == 0 && !reader.failure();
}

} // namespace velmora
