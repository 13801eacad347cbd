// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/CorpusTools.h"
#include "Fuzz/Decoders/DecoderSession.h"
#include "Fuzz/DriveMessages.h"
#include "Fuzz/FuzzCorpora.h"
#include "LogMessages/LogMessage.h"

namespace velmora {

namespace {

/// What a snapshot would save of a technology's drive: the first message of each code, a redraw after every
/// `perRedraw` of them. The displays are empty, since no reader reads them.
Value savedContents(const FuzzedTechnology& technology, std::size_t perRedraw) {
    const ShippedTemplates templates;
    const DecoderMaker maker(technology);
    DecoderSession session(maker);
    std::size_t count = 0;
    for (const Data& message : driveMessages(technology.scenario, std::chrono::minutes(1), 1)) {
        if (message.size() > 200)
            continue; // long ones add nothing but length
        static_cast<void>(session.update(message));
        if (++count % perRedraw == 0)
            session.redraw();
    }
    session.redraw();
    const ArrayRef contents = makeArray();
    const ArrayRef all = session.decoder().getSaveContentsFromState(session.state());
    for (const Value& entry : *all) {
        const DictionaryRef saved = makeDictionary();
        for (const auto& [key, value] : *entry.asDictionary())
            saved->set(key, key == "Display" ? Value(makeDictionary()) : value);
        contents->append(saved);
    }
    return contents;
}

} // namespace

FuzzCorpus dlfCorpus() {
    FuzzCorpus corpus;
    for (std::size_t i = 0; i < binaryTechnologies; ++i) {
        for (const std::size_t perRedraw : {1u, 2u, 3u}) {
            const Value contents = savedContents(fuzzedTechnologies[i], perRedraw);
            const Array& entries = *contents.asArray();
            const Data* log = (*entries[entries.size() - 1].asDictionary())["DLF"].asData();
            corpus.seeds.push_back(withFirstByte(static_cast<std::uint8_t>(perRedraw - 1), log->bytes()));
        }
    }
    for (const std::uint8_t begin :
         {LogMessage::basebandType, LogMessage::prefixMarker, LogMessage::extraType})
        corpus.tokens.push_back(withFirstByte(begin, {}));
    corpus.tokens.emplace_back(std::vector<std::uint8_t>{0xA1, 0x00, 0xFD, 0x1F});
    return corpus;
}

FuzzCorpus snapshotCorpus() {
    FuzzCorpus corpus = {{}, propertyListTokens()};
    for (const FuzzedTechnology& technology : fuzzedTechnologies) {
        const DictionaryRef snapshot = makeDictionary();
        snapshot->set("Timestamp", "2026-11-16 05:00:08 +0000");
        snapshot->set("Data", savedContents(technology, 2));
        snapshot->set("Description", "drive");
        std::vector<Data> forms;
        addBothForms(forms, snapshot);
        for (const Data& form : forms)
            corpus.seeds.push_back(withFirstByte(255, form.bytes()));
    }
    for (const char* key :
         {"Timestamp", "Data", "Description", "DisplayState", "Display", "ExtraInfo", "Date", "DLF"})
        corpus.tokens.push_back(textData(key));
    return corpus;
}

} // namespace velmora
