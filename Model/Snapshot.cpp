// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Model/Snapshot.h"
#include "Platform/DateText.h"

namespace velmora {

DictionaryRef makeSnapshot(Time timeStamp, const ArrayRef& saveContents, std::string_view description) {
    DictionaryRef snapshot = makeDictionary();
    snapshot->set("Timestamp", dateDescription(timeStamp));
    if (!saveContents)
        return snapshot; // the pairs end at the first whose value is missing
    snapshot->set("Data", saveContents);
    snapshot->set("Description", description);
    return snapshot;
}

} // namespace velmora
