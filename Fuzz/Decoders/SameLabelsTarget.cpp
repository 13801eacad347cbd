// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/Decoders/DecoderSession.h"
#include "Fuzz/Decoders/MessageScript.h"
#include "Fuzz/FuzzTargets.h"
#include "Fuzz/PropertyLists/SameValue.h"
#include "LogMessages/LogMessage.h"

#include <algorithm>
#include <array>

namespace velmora {

namespace {

/// Records that a decoder remembers on purpose: what later ones show depends on them. They are left out of
/// the traffic.
struct Remembered {
    std::string_view templateName;
    std::uint32_t code;
};
constexpr Remembered remembered[] = {
    {"Ostrel_GSM", 0x51FF},  // the BSICs of the channels that 0x5137 lists
    {"C2KTemplate", 0x119D}, // the running average of frame errors
    {"C2KTemplate", 0x1192}, // the counters that a data rate is counted from, forward
    {"C2KTemplate", 0x127E}, // and reverse
};

bool isRemembered(const FuzzedTechnology& technology, const Data& message) {
    const auto header = LogMessage::parse(message.bytes());
    return header && std::any_of(std::begin(remembered), std::end(remembered), [&](const Remembered& each) {
               return each.templateName == technology.templateName && each.code == header->logCode();
           });
}

/// Puts a row into every list that no decoder would, so that a list is seen to be written even when it is
/// written empty.
void markLists(const Value& node) {
    if (const Dictionary* dictionary = node.asDictionary()) {
        for (const auto& [key, value] : *dictionary)
            markLists(value);
    } else if (Array* array = node.asArray()) {
        array->append("unwritten");
    }
}

/// Expects whatever a record changed in the display that knew nothing else to be the same in the other.
void expectSameWhereWritten(const Value& before, const Value& after, const Value& other) {
    if (sameValue(before, after))
        return;
    const Dictionary* dictionary = after.asDictionary();
    if (!dictionary || !before.asDictionary()) {
        require(sameValue(after, other), "what a record writes does not depend on earlier ones");
        return;
    }
    const Dictionary* others = other.asDictionary();
    require(others != nullptr, "a screen stays one");
    for (const auto& [key, value] : *dictionary)
        expectSameWhereWritten((*before.asDictionary())[key], value, (*others)[key]);
}

/// The input's first byte chooses the technology, the rest is a MessageScript whose last message is decoded
/// twice: by a decoder that has gone through the steps before it, and by one that has seen nothing else.
class SameLabelsTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        if (input.empty())
            return;
        const std::size_t choice = input.front() % std::size(fuzzedTechnologies);
        const DecoderMaker& maker = _makers[choice];
        DecoderSession busy(maker);
        MessageScript script(input.subspan(1));
        std::optional<Data> last;
        int reconnects = 0;
        while (const auto step = script.next()) {
            if (step->kind == MessageScript::Kind::Reconnect && ++reconnects <= maximumReconnects)
                busy.reconnect();
            if (step->kind != MessageScript::Kind::Message)
                continue;
            if (last && !isRemembered(fuzzedTechnologies[choice], *last) && !busy.update(*last))
                return;
            last = step->message;
        }
        if (last)
            compare(busy, maker, *last);
    }

private:
    static void compare(DecoderSession& busy, const DecoderMaker& maker, const Data& message) {
        DecoderSession fresh(maker);
        fresh.redraw(); // builds the display
        markLists(fresh.display());
        const Value before = fresh.display().copy();
        const bool freshLives = fresh.update(message);
        require(busy.update(message) == freshLives, "the same records end the program");
        if (freshLives)
            expectSameWhereWritten(before, fresh.display(), busy.display());
    }

    ShippedTemplates _templates;
    std::array<DecoderMaker, std::size(fuzzedTechnologies)> _makers{
        DecoderMaker(fuzzedTechnologies[0]), DecoderMaker(fuzzedTechnologies[1]),
        DecoderMaker(fuzzedTechnologies[2]), DecoderMaker(fuzzedTechnologies[3]),
        DecoderMaker(fuzzedTechnologies[4]), DecoderMaker(fuzzedTechnologies[5])};
};

} // namespace

std::unique_ptr<FuzzTarget> makeSameLabelsTarget() {
    return std::make_unique<SameLabelsTarget>();
}

} // namespace velmora
