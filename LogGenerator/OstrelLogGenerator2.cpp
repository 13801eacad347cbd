// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/OstrelLogGenerator2.h"

#include "LogGenerator/Display/SectionPlaces.h"
#include "LogGenerator/MessageEffects.h"
#include "LogGenerator/Observations/CatalogueWriter.h"
#include "LogGenerator/Observations/Observer.h"
#include "LogMessages/LogMessage.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"
#include "PropertyLists/PropertyList.h"

#include <algorithm>
#include <charconv>
#include <exception>

namespace velmora {

namespace {

Value loadTemplate(const std::string& name) {
    const Result<Data> file = resources().read(name, "plist");
    if (!file) {
        logFormat(LogPriority::Error, "%s", file.reason().c_str());
        return {};
    }
    const Result<Value> root = readPropertyList(file->bytes());
    if (!root) {
        logFormat(LogPriority::Error, "%s.plist: %s", name.c_str(), root.reason().c_str());
        return {};
    }
    if (!root->asDictionary()) {
        logFormat(LogPriority::Error, "%s.plist: the root is of kind %s, wanted a dictionary", name.c_str(),
                  std::string(nameOf(root->kind())).c_str());
        return {};
    }
    return *root;
}

/// Announces the index before the base class announces the object.
const Clock& announce(const ClassIndex& index, const Clock& clock) {
    logFormat(LogPriority::Error, "Creating OstrelLogGenerator2 object with %p",
              static_cast<const void*>(&index));
    return clock;
}

} // namespace

OstrelLogGenerator2::OstrelLogGenerator2(std::string plistName, std::shared_ptr<ClassIndex> index,
                                         const Clock& clock)
    : OstrelLogGenerator(announce(*index, clock)), pListName(std::move(plistName)), cIndex(std::move(index)) {
    logFormat(LogPriority::Error, "Class Index: %ld", cIndex.use_count());
}

OstrelLogGenerator2::~OstrelLogGenerator2() {
    try {
        cIndex->writeNodes();
    } catch (const std::exception& failure) {
        logFormat(LogPriority::Error, "the display lacks its last records: %s", failure.what());
    }
    // The same text for every technology.
    logFormat(LogPriority::Warning, "Ostrel_GSMLogGenerator is destructed %p", static_cast<void*>(this));
}

void OstrelLogGenerator2::updateState(Dictionary& state, const Data& data) {
    // Builds the display on the first message.
    if (!_sectionsAttached || !state.contains("Display"))
        static_cast<void>(getDisplayFromState(state));
    updateWithData(data);
    keepMessage(data); // every message, routed or not, with its prefix
}

void OstrelLogGenerator2::updateStateReporting(Dictionary& state, const Data& data, MessageEffects& effects) {
    if (!_sectionsAttached || !state.contains("Display"))
        static_cast<void>(getDisplayFromState(state));
    const std::optional<std::uint32_t> code = route(data);
    keepMessage(data);
    effects.sections(code);
    const std::vector<Base*>* subscribers = code ? cIndex->getSubscribers(*code) : nullptr;
    if (!subscribers)
        return;
    for (auto section = subscribers->begin(); section != subscribers->end(); ++section)
        // A section that lists a code twice is called twice and reported once.
        if ((*section)->isWanted() && std::find(subscribers->begin(), section, *section) == section)
            effects.concerned(**section);
}

void OstrelLogGenerator2::updateWithData(const Data& message) {
    static_cast<void>(route(message));
}

std::optional<std::uint32_t> OstrelLogGenerator2::route(const Data& message) {
    const std::optional<LogMessage> parsed = LogMessage::parse(message.bytes());
    if (!observer())
        return parsed ? routeParsed(message, *parsed) : std::nullopt;
    observer()->beginMessage();
    if (!parsed)
        observer()->damaged(Damage::NoRecord);
    const std::optional<std::uint32_t> code = parsed ? routeParsed(message, *parsed) : std::nullopt;
    passObservations(code, parsed ? parsed->timestamp() : std::nullopt);
    return code;
}

std::optional<std::uint32_t> OstrelLogGenerator2::routeParsed(const Data& message, const LogMessage& parsed) {
    if (parsed.type != LogMessage::basebandType && parsed.type != LogMessage::extraType) {
        logFormat(LogPriority::Error, "Invalid log type: %x. Dropping.", static_cast<unsigned>(parsed.type));
        if (observer())
            observer()->damaged(Damage::WrongType);
        return std::nullopt;
    }
    const std::uint32_t code = parsed.logCode();
    std::optional<Data> stripped;
    if (parsed.prefixed)
        stripped = message.from(LogMessage::prefixLength);
    const Data& data = stripped ? *stripped : message;
    if (const std::vector<Base*>* subscribers = cIndex->getSubscribers(code)) {
        const CellList::SameRecordScope sameRecord(cIndex->cellList());
        for (Base* section : *subscribers)
            section->updateWithData(data, code);
    }
    return code;
}

Value OstrelLogGenerator2::getDisplayFromState(Dictionary& state) {
    if (const Value& display = state["Display"]; !display.isNone()) {
        if (!_sectionsAttached) {
            attachSections(display, state["Template"]);
            selectSections(*cIndex, display, _wanted);
        }
        _sectionsAttached = true;
        cIndex->writeNodes();
        return display;
    }
    if (state["Template"].isNone()) {
        Value loaded = loadTemplate(pListName);
        if (loaded.isNone()) {
            logLine(LogPriority::Error, "Cannot load template for display");
            return {};
        }
        state.set("Template", std::move(loaded));
    }
    logFormat(LogPriority::Warning, "Initialized class index: %p, Self: %p", static_cast<void*>(cIndex.get()),
              static_cast<void*>(this));
    cIndex->status();
    const Value display = processTemplate(state["Template"]);
    printDict(display);
    selectSections(*cIndex, display, _wanted);
    state.set("Display", display);
    state.set("ExtraInfo", makeDictionary());
    _sectionsAttached = true;
    return {}; // not the display: see the header
}

void OstrelLogGenerator2::attachSections(const Value& display, const Value& shape) {
    // The state outlives decoders. After a reconnection this decoder's sections have no nodes yet while the
    // display of the earlier one is still shown: they continue in it, and nothing that it shows is lost.
    const Array* const elements = display.asArray();
    const Array* const shapes = shape.asArray();
    if (elements && shapes) {
        for (std::size_t i = 0; i < std::min(elements->size(), shapes->size()); ++i)
            attachSections((*elements)[i], (*shapes)[i]);
        return;
    }
    const Dictionary* const nodes = display.asDictionary();
    const Dictionary* const wanted = shape.asDictionary();
    if (!nodes || !wanted)
        return;
    for (const auto& [key, value] : *nodes) {
        // What a section shows may have the name of another section, as "SIM" in a list of SIM slots.
        const Value* const below = wanted->find(key);
        if (!below)
            continue;
        if (Base* section = cIndex->getClass(key))
            section->updateSectionRef(value);
        attachSections(value, *below);
    }
}

Value OstrelLogGenerator2::processTemplate(const Value& object) {
    switch (object.kind()) {
    case Value::Kind::String: return object;
    case Value::Kind::Array: {
        ArrayRef result = makeArray();
        for (const Value& element : *object.asArray())
            if (Value processed = processTemplate(element); !processed.isNone())
                result->append(std::move(processed));
        return result;
    }
    case Value::Kind::Dictionary: {
        DictionaryRef result = makeDictionary();
        // Keys are strings by construction: the property-list reader refuses any other.
        for (const auto& [key, value] : *object.asDictionary()) {
            Value processed = processTemplate(value);
            if (processed.isNone())
                continue; // a foreign kind has been reported; its key is skipped
            if (Base* section = cIndex->getClass(key))
                section->updateSectionRef(processed);
            result->set(key, std::move(processed));
        }
        return result;
    }
    default:
        logLine(LogPriority::Error, "Received an object of unknown type");
        logLine(LogPriority::Warning, "Processing the template");
        return {};
    }
}

void OstrelLogGenerator2::describe(Catalogue& catalogue) {
    const Value source = loadTemplate(pListName);
    Places places;
    findSections(source, catalogue.root(), places);
    // In the order of the display, which is that of the template.
    describeSections(source, places, catalogue);
}

void OstrelLogGenerator2::findSections(const Value& object, Catalogue::Node& node, Places& places) const {
    if (const Dictionary* const dictionary = object.asDictionary()) {
        for (const auto& [key, value] : *dictionary) {
            Catalogue::Node& child = node.child(key);
            if (Base* const section = cIndex->getClass(key))
                places[section] = {&child, value.asArray() != nullptr};
            findSections(value, child, places);
        }
    }
}

void OstrelLogGenerator2::describeSections(const Value& object, Places& places, Catalogue& catalogue) {
    const Dictionary* const dictionary = object.asDictionary();
    if (!dictionary)
        return;
    for (const auto& [key, value] : *dictionary) {
        if (const auto found = places.find(cIndex->getClass(key)); found != places.end()) {
            describeSection(*found->first, found->second, catalogue);
            places.erase(found);
        }
        describeSections(value, places, catalogue);
    }
}

void OstrelLogGenerator2::describeSection(const Base& section, const Place& place, Catalogue& catalogue) {
    FieldMap& map = _fieldMaps[&section];
    map = FieldMap(catalogue, std::string(section.getSectionName()));
    // What is named for a node of the other kind is not shown.
    CatalogueWriter writer(catalogue, map, [&place](std::string_view label) {
        std::vector<Catalogue::Node*> nodes;
        if (label.empty() == place.isList)
            nodes.push_back(label.empty() ? place.node : &place.node->child(label));
        return nodes;
    });
    for (const View& view : section.views()) {
        writer.setCode(view.code);
        section.describe(view, writer);
    }
}

void OstrelLogGenerator2::observe(Observer* observer) {
    for (const auto& [name, section] : cIndex->classDict) {
        const auto map = _fieldMaps.find(section);
        if (map == _fieldMaps.end())
            continue;
        if (observer)
            map->second.setWanted(observer->wanted());
        section->observe(observer, &map->second);
    }
}

std::optional<Time> OstrelLogGenerator2::latestRecord(std::string_view section) const {
    const auto map = _fieldMaps.find(cIndex->getClass(section));
    return map == _fieldMaps.end() ? std::nullopt : map->second.latestRecord();
}

void OstrelLogGenerator2::printDict(const Value& object) const {
    if (object.asString())
        return;
    if (const Dictionary* dictionary = object.asDictionary()) {
        for (const auto& [key, value] : *dictionary)
            printDict(value);
    } else if (const Array* array = object.asArray()) {
        for (const Value& element : *array)
            printDict(element);
    } else {
        logLine(LogPriority::Error, "Received an object of unknown type");
    }
}

Value OstrelLogGenerator2::generateLogUsingState(Dictionary& state) {
    Value display = getDisplayFromState(state);
    endRefresh(state);
    return display;
}

Value OstrelLogGenerator2::display(Dictionary& state) {
    cIndex->writeNodes();
    return state["Display"];
}

void OstrelLogGenerator2::setWantedPaths(std::span<const std::string> paths) {
    // One section's log line of that priority has all of its node.
    if (!isLogged(LogPriority::Warning))
        _wanted = {false, {paths.begin(), paths.end()}};
}

std::vector<ChangingPlace> OstrelLogGenerator2::changingPlaces(const Dictionary& state) const {
    return sectionPlaces(*cIndex, state["Display"]);
}

Value OstrelLogGenerator2::memory() const {
    const DictionaryRef all = makeDictionary();
    for (const auto& [name, section] : cIndex->classDict)
        if (Value memory = section->memory(); !memory.isNone())
            all->set(name, std::move(memory));
    return all->empty() ? Value() : Value(all);
}

void OstrelLogGenerator2::setMemory(const Value& memory) {
    if (const Dictionary* const all = memory.asDictionary())
        for (const auto& [name, value] : *all)
            if (Base* const section = cIndex->getClass(name))
                section->setMemory(value);
}

DictionaryRef OstrelLogGenerator2::getStartCommand() const {
    const ArrayRef logCodes = makeArray();
    const ArrayRef extraCodes = makeArray();
    for (const std::string& key : cIndex->getAllLogCodes()) {
        std::uint32_t code = 0;
        std::from_chars(key.data(), key.data() + key.size(), code);
        if (code >= LogMessage::firstExtraCode)
            extraCodes->append(code - LogMessage::firstExtraCode);
        else
            logCodes->append(code);
    }
    DictionaryRef command = makeDictionary();
    command->set("SetState", "Streaming");
    command->set("SetOstrelLogCodes", logCodes);
    command->set("SetVoxExtraCodes", extraCodes);
    return command;
}

} // namespace velmora
