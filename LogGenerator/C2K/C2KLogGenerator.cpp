// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/C2K/C2KLogGenerator.h"

#include "LogGenerator/C2K/LogCodeParsers.h"
#include "LogGenerator/C2K/Targets.h"
#include "LogGenerator/C2K/ValueVisitor.h"
#include "LogGenerator/MessageEffects.h"
#include "LogGenerator/Observations/CatalogueWriter.h"
#include "LogGenerator/Observations/Observer.h"
#include "LogMessages/LogMessage.h"
#include "Platform/Resources.h"
#include "Platform/SystemLog.h"

#include "PropertyLists/PropertyList.h"
#include <exception>
#include <functional>
#include <map>
#include <vector>

namespace velmora {

namespace {

constexpr std::string_view sortedMarker = "_sorted";

/// The template, or none. The reason is logged in addition to the caller's error line.
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

/// Reports the values that a message published.
class EffectsVisitor final : public C2K::ValueVisitor {
public:
    explicit EffectsVisitor(MessageEffects& effects) : _effects(effects) {}

private:
    void publishText(std::string_view valueKey, std::string_view text) override {
        _effects.value(valueKey, text);
    }
    void publish(std::string_view valueKey, const Value& value) override { _effects.value(valueKey, value); }

    MessageEffects& _effects;
};

/// The nodes that show each value key, by the template.
using Places = std::map<std::string, std::vector<Catalogue::Node*>, std::less<>>;

void findPlaces(const Dictionary& source, Catalogue::Node& node, Catalogue& catalogue, Places& places) {
    for (const auto& [label, value] : source) {
        if (const Dictionary* const screen = value.asDictionary()) {
            findPlaces(*screen, node.child(label), catalogue, places);
        } else if (const std::string* const key = value.asString(); key && *key != sortedMarker) {
            Catalogue::Node& shown = node.child(label);
            // The template's own text is shown until there is a value.
            CatalogueField& leaf = catalogue.leafAt(shown, "");
            leaf.kind = ObservedKind::Absent;
            leaf.absentTexts.emplace_back();
            places[*key].push_back(&shown);
        }
    }
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

C2KLogGenerator::~C2KLogGenerator() {
    try {
        _readings.write();
    } catch (const std::exception& failure) {
        logFormat(LogPriority::Error, "the display lacks its last records: %s", failure.what());
    }
}

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

void C2KLogGenerator::updateStateReporting(Dictionary& state, const Data& data, MessageEffects& effects) {
    update(state, data, &effects);
}

void C2KLogGenerator::update(Dictionary& state, const Data& data, MessageEffects* effects) {
    // Builds the display on the first message.
    if (!state.contains("Display")) {
        static_cast<void>(getDisplayFromState(state));
        limit(state);
    }
    updateFromLog(data, state["Lookup"].dictionaryRef(), state, effects);
}

void C2KLogGenerator::updateFromLog(const Data& data, const DictionaryRef& lookup, Dictionary& state,
                                    MessageEffects* effects) {
    const std::optional<LogMessage> message = LogMessage::parse(data.bytes());
    if (Observer* const observing = observer())
        observing->beginMessage();
    decode(data, message, lookup, state, effects);
    if (observer())
        passObservations(message ? std::optional(message->logCode()) : std::nullopt,
                         message ? message->timestamp() : std::nullopt);
}

void C2KLogGenerator::decode(const Data& data, const std::optional<LogMessage>& message,
                             const DictionaryRef& lookup, Dictionary& state, MessageEffects* effects) {
    if (effects)
        effects->values(message ? std::optional(message->logCode()) : std::nullopt);
    if (!message) {
        if (observer())
            observer()->damaged(Damage::NoRecord);
        return;
    }
    // On purpose the record is decoded although the line says "Dropping"; only the codes of the extra stream,
    // for which the line is written as well, match no parser.
    if (message->type != LogMessage::basebandType) {
        logFormat(LogPriority::Error, "Invalid log type: %x. Dropping.",
                  static_cast<unsigned>(message->type));
        if (observer())
            observer()->damaged(Damage::WrongType);
    }
    const C2K::LogCodeParser* const parser = C2K::parserOfCode(message->logCode());
    if (!parser)
        return;
    const std::optional<C2K::Reading> reading = parser->accept(Record(message->record), state);
    if (observer() && (!reading || reading->isIncomplete))
        observer()->damaged(Damage::TooShort);
    if (reading) {
        if (effects) {
            EffectsVisitor reporting(*effects);
            FieldVisitor* const direct = effects->valueVisitor();
            parser->decode(*reading, direct ? *direct : reporting);
        }
        // No parser removes what records of another code show.
        if (Observer* const observing = observer(); observing && _fieldMap.hasCode(message->logCode()))
            if (observing->beginSection(_fieldMap, message->logCode()))
                parser->decode(*reading, *observing);
        _readings.use(lookup);
        _readings.keep(*parser, *reading);
    }
    keepMessage(message->prefixed ? data.from(LogMessage::prefixLength) : data);
}

Value C2KLogGenerator::generateLogUsingState(Dictionary& state) {
    _readings.write();
    Value display = getDisplayFromState(state);
    endRefresh(state);
    return display;
}

Value C2KLogGenerator::display(Dictionary& state) {
    _readings.write();
    return state["Display"];
}

void C2KLogGenerator::limit(const Dictionary& state) {
    Dictionary* const lookup = state["Lookup"].asDictionary();
    if (!lookup || _wanted.isWhole)
        return;
    C2K::dropUnselected(*lookup, state["Display"], _wanted);
    for (const C2K::LogCodeParser* const parser : C2K::logCodeParsers())
        _readings.setKept(*parser, C2K::hasTargets(*parser, *lookup));
}

std::vector<ChangingPlace> C2KLogGenerator::changingPlaces(const Dictionary& state) const {
    std::vector<ChangingPlace> places;
    if (const Dictionary* const lookup = state["Lookup"].asDictionary())
        for (std::size_t i = 0; i < C2K::logCodeParsers().size(); ++i)
            C2K::addTargets(*C2K::logCodeParsers()[i], *lookup, _readings.changes(i), places);
    return places;
}

void C2KLogGenerator::describe(Catalogue& catalogue) {
    const Value source = loadTemplate();
    Places places;
    if (const Dictionary* const root = source.asDictionary())
        findPlaces(*root, catalogue.root(), catalogue, places);
    _fieldMap = FieldMap(catalogue, "");
    CatalogueWriter writer(catalogue, _fieldMap, [&places](std::string_view valueKey) {
        const auto found = places.find(valueKey);
        return found == places.end() ? std::vector<Catalogue::Node*>() : found->second;
    });
    for (const C2K::LogCodeParser* const parser : C2K::logCodeParsers()) {
        writer.setCode(parser->logCode());
        parser->describe(writer);
    }
}

void C2KLogGenerator::observe(Observer* observer) {
    if (observer)
        _fieldMap.setWanted(observer->wanted());
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
