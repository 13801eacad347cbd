// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/CorpusTools.h"
#include "Fuzz/Decoders/DecoderSession.h"
#include "Fuzz/DriveMessages.h"
#include "Fuzz/FuzzCorpora.h"
#include "LogMessages/LogMessage.h"
#include "Tests/PropertyLists/PropertyListSamples.h"

namespace velmora {

namespace {

constexpr std::string_view xmlWords[] = {
    "<plist version=\"1.0\">",
    "</plist>",
    "<dict>",
    "</dict>",
    "<dict/>",
    "<array>",
    "</array>",
    "<array/>",
    "<key>",
    "</key>",
    "<string>",
    "</string>",
    "<integer>",
    "</integer>",
    "<real>",
    "</real>",
    "<true/>",
    "<false/>",
    "<date>",
    "</date>",
    "<data>",
    "</data>",
    "<!--",
    "-->",
    "<![CDATA[",
    "]]>",
    "&amp;",
    "&#x41;",
    "2026-11-16T05:00:00Z",
    "-9223372036854775808",
    "nan",
    "-inf",
    "bplist00",
};

/// The lists of the messages that hold one.
void addLists(std::vector<Data>& seeds, std::string_view scenario) {
    for (const Data& message : driveMessages(scenario, std::chrono::minutes(2), 1)) {
        const auto header = LogMessage::parse(message.bytes());
        const Bytes payload =
            header && header->type == LogMessage::extraType ? header->payload() : message.bytes();
        if (const auto list = readPropertyList(payload))
            addBothForms(seeds, *list);
    }
}

std::vector<Value> shippedTemplates() {
    std::vector<Value> templates;
    for (std::size_t i = 0; i < binaryTechnologies; ++i)
        templates.push_back(ShippedTemplates::read(fuzzedTechnologies[i].templateName));
    return templates;
}

} // namespace

std::vector<Data> propertyListTokens() {
    return textDatas(xmlWords);
}

FuzzCorpus propertyListCorpus() {
    FuzzCorpus corpus{{}, propertyListTokens()};
    addLists(corpus.seeds, "gsm");
    addLists(corpus.seeds, "ifx");
    addBothForms(corpus.seeds, everyKind());
    addBothForms(corpus.seeds, nestedArrays(PropertyListLimits{}.maximumDepth));
    for (const Value& list : shippedTemplates())
        addBothForms(corpus.seeds, list);
    return corpus;
}

FuzzCorpus templateCorpus() {
    FuzzCorpus corpus{{}, propertyListTokens()};
    const std::vector<Value> templates = shippedTemplates();
    for (std::size_t i = 0; i < templates.size(); ++i) {
        std::vector<Data> forms;
        addBothForms(forms, templates[i]);
        for (const Data& form : forms)
            corpus.seeds.push_back(withFirstByte(static_cast<std::uint8_t>(i), form.bytes()));
    }
    return corpus;
}

} // namespace velmora
