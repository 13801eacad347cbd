// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/C2KLogGenerator.h"

#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/MessageEffects.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"
#include "PropertyLists/PropertyList.h"

namespace velmora {

namespace {

constexpr std::size_t headerLength = 13;
constexpr std::size_t prefixLength = 2;
constexpr std::uint8_t prefixMarker = 0x81;
constexpr std::uint8_t basebandType = 1;
constexpr std::uint8_t extraType = 0xFF;
/// What moves the extra stream's codes out of the way of the baseband's.
constexpr std::uint32_t firstExtraCode = 0xFF0000;

constexpr std::string_view sortedMarker = "_sorted";

/// The template, or none. Why there is none is told beside the error line that the caller writes.
Value loadTemplate() {
    const Result<Data> file = resources().read("C2KTemplate", "plist");
    if (!file) {
        logLine(LogPriority::Notice, file.reason());
        return {};
    }
    const Result<Value> root = readPropertyList(file->bytes());
    if (!root) {
        logFormat(LogPriority::Notice, "C2KTemplate.plist: %s", root.reason().c_str());
        return {};
    }
    if (!root->asDictionary()) {
        logFormat(LogPriority::Notice, "C2KTemplate.plist: the root is of kind %s, wanted a dictionary",
                  std::string(nameOf(root->kind())).c_str());
        return {};
    }
    return *root;
}

/// Adds a label to those that show the value key.
void addTarget(Dictionary& lookup, std::string_view valueKey, std::string_view label,
               const DictionaryRef& display) {
    ArrayRef targets = lookup[valueKey].arrayRef();
    if (!targets) {
        targets = makeArray();
        lookup.set(valueKey, targets);
    }
    const DictionaryRef target = makeDictionary();
    target->set("key", label);
    target->set("dict", display);
    targets->append(target);
}

} // namespace

std::unique_ptr<C2KLogGenerator> C2KLogGenerator::generator(const Clock& clock) {
    return std::make_unique<C2KLogGenerator>(clock);
}

DictionaryRef C2KLogGenerator::getStartCommand() const {
    const ArrayRef logCodes = makeArray();
    for (const C2K::LogCodeParser* parser : C2K::logCodeParsers())
        logCodes->append(parser->logCode());
    DictionaryRef command = makeDictionary();
    command->set("SetState", "Streaming");
    command->set("SetOstrelLogCodes", logCodes);
    return command;
}

void C2KLogGenerator::updateState(Dictionary& state, const Data& data) {
    update(state, data, nullptr);
}

void C2KLogGenerator::updateStateTelling(Dictionary& state, const Data& data, MessageEffects& effects) {
    update(state, data, &effects);
}

void C2KLogGenerator::update(Dictionary& state, const Data& data, MessageEffects* effects) {
    // Builds the display on the first message.
    if (!state.contains("Display"))
        static_cast<void>(getDisplayFromState(state));
    updateFromLog(data, state["Lookup"].dictionaryRef(), state, effects);
}

void C2KLogGenerator::updateFromLog(const Data& data, const DictionaryRef& lookup, Dictionary& state,
                                    MessageEffects* effects) {
    if (data.size() < headerLength) {
        if (effects)
            effects->values(std::nullopt);
        return;
    }
    const Data stripped = data.bytes().front() == prefixMarker ? data.from(prefixLength) : data;
    const Record record(stripped);
    const std::uint8_t type = record.u8(0);
    // Despite its last word the record is decoded on; only the codes of the extra stream, for which the line
    // is written as well, match no parser. Both are meant.
    if (type != basebandType)
        logFormat(LogPriority::Error, "Invalid log type: %x. Dropping.", static_cast<unsigned>(type));
    const std::uint32_t code = record.u16(3) + (type == extraType ? firstExtraCode : 0);
    if (effects)
        effects->values(code);
    const C2K::LogCodeParser* parser = C2K::parserOfCode(code);
    if (!parser)
        return;
    _targets.use(lookup);
    parser->parse(record, state, C2K::Publisher(_targets, effects));
    keep(stripped);
}

Value C2KLogGenerator::generateLogUsingState(Dictionary& state) {
    Value display = getDisplayFromState(state);
    keepRefresh(state);
    return display;
}

void C2KLogGenerator::processTemplate(const Dictionary& source, const DictionaryRef& display,
                                      Dictionary& lookup) {
    for (const auto& [label, value] : source) {
        if (const Dictionary* screen = value.asDictionary()) {
            const DictionaryRef subDisplay = makeDictionary();
            processTemplate(*screen, subDisplay, lookup);
            display->set(label, subDisplay);
        } else if (const std::string* text = value.asString(); text && *text == sortedMarker) {
            display->set(label, sortedMarker);
        } else if (text) {
            display->set(label, "");
            addTarget(lookup, *text, label, display);
        }
    }
    logLine(LogPriority::Warning, "Processing the template");
}

Value C2KLogGenerator::getDisplayFromState(Dictionary& state) {
    if (const Value& display = state["Display"]; !display.isNone())
        return display;
    DictionaryRef source = state["Template"].dictionaryRef();
    if (!source) {
        const Value loaded = loadTemplate();
        source = loaded.dictionaryRef();
        if (!source) {
            logLine(LogPriority::Error, "Cannot load C2K template for display");
            return {};
        }
        state.set("Template", loaded);
    }
    const DictionaryRef display = makeDictionary();
    const DictionaryRef lookup = makeDictionary();
    processTemplate(*source, display, *lookup);
    state.set("Display", display);
    state.set("Lookup", lookup);
    state.set("ExtraInfo", makeDictionary());
    return display;
}

} // namespace velmora
