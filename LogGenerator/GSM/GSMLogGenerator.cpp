// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/GSM/GSMLogGenerator.h"

#include "LogGenerator/GSM/AssertionFailure.h"
#include "LogGenerator/GSM/KnownFields.h"
#include "LogGenerator/Observations/Observer.h"
#include "PropertyLists/PropertyList.h"

namespace velmora {

namespace {

// The line numbers identify the assertions to users and do not follow the source.
constexpr const char* assertionFile = "LogGenerator/GSM/GSMLogGenerator";
constexpr int unknownObjectLine = 78;
constexpr int notDeserializedLine = 90;

/// The value of a one-entry dictionary, else the object itself.
Value collapsed(const Value& object) {
    const Dictionary* dictionary = object.asDictionary();
    return dictionary && dictionary->size() == 1 ? dictionary->begin()->value : object;
}

} // namespace

std::unique_ptr<GSMLogGenerator> GSMLogGenerator::generator(const Clock& clock) {
    return std::make_unique<GSMLogGenerator>(clock);
}

Value GSMLogGenerator::processObject(const Value& object) {
    switch (object.kind()) {
    case Value::Kind::String: return object;
    case Value::Kind::Dictionary: {
        const DictionaryRef result = makeDictionary();
        for (const auto& [key, value] : *object.asDictionary())
            result->set(key, collapsed(processObject(value)));
        return result;
    }
    case Value::Kind::Array: {
        const ArrayRef result = makeArray();
        for (const Value& element : *object.asArray())
            result->append(collapsed(processObject(element)));
        return result;
    }
    default:
        throw AssertionFailure("Unknown object of type " + std::string(nameOf(object.kind())) +
                                   " encountered",
                               assertionFile, unknownObjectLine);
    }
}

Value GSMLogGenerator::canCollapse(const Value& object) const {
    const Dictionary* dictionary = object.asDictionary();
    return dictionary && dictionary->size() == 1 ? dictionary->begin()->value : Value();
}

void GSMLogGenerator::updateState(Dictionary& state, const Data& data) {
    Observer* const observing = observer();
    if (observing)
        observing->beginMessage();
    Result<Value> object = readPropertyList(data.bytes(), messageLimits);
    if (!object)
        throw AssertionFailure("Could not deserialize the object", assertionFile, notDeserializedLine);
    Value display = processObject(*object);
    state.set("DisplayState", *std::move(object));
    if (observing) {
        observing->display(catalogue(), display);
        passObservations(std::nullopt, std::nullopt);
    }
    state.set("Display", std::move(display));
    state.set("ExtraInfo", makeDictionary());
}

void GSMLogGenerator::describe(Catalogue& catalogue) {
    catalogue.setReadsNumbersFromTexts();
    catalogue.root().setOpen();
    describeKnownFields(catalogue);
}

Value GSMLogGenerator::generateLogUsingState(Dictionary& state) {
    if (keepsHistory())
        updateHistoryInState(state, clock());
    return state["Display"];
}

DictionaryRef GSMLogGenerator::getStartCommand() const {
    DictionaryRef command = makeDictionary();
    command->set("SetState", "Streaming");
    return command;
}

ArrayRef GSMLogGenerator::getSaveContentsFromState(const Dictionary& state) const {
    ArrayRef contents = makeArray();
    if (const Array* history = state["History"].asArray())
        for (const Value& entry : *history)
            contents->append(entry);
    return contents;
}

} // namespace velmora
