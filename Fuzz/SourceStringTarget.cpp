// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/FuzzTargets.h"
#include "Telephony/Sources/SourceString.h"

#include <array>
#include <charconv>
#include <string>

namespace velmora {

namespace {

std::string numberText(double number) {
    std::array<char, 400> text{};
    const auto [end, error] = std::to_chars(text.data(), text.data() + text.size(), number);
    require(error == std::errc(), "a number has a text");
    return {text.data(), end};
}

std::string textOf(const ScenarioChoice& choice) {
    return "scenario:" + choice.name + ",seed=" + std::to_string(choice.seed) +
           ",speed=" + numberText(choice.speed);
}

std::string textOf(const ReplayChoice& choice) {
    return "replay:" + choice.file + ",speed=" + numberText(choice.speed) + (choice.loop ? ",loop" : "") +
           (choice.technology.empty() ? "" : ",technology=" + choice.technology);
}

std::string textOf(const ModemManagerChoice& choice) {
    return "modemmanager" + (choice.modem.empty() ? "" : ",modem=" + choice.modem) +
           (choice.sim.empty() ? "" : ",sim=" + choice.sim);
}

bool same(const ScenarioChoice& a, const ScenarioChoice& b) {
    return a.name == b.name && a.seed == b.seed && a.speed == b.speed;
}

bool same(const ReplayChoice& a, const ReplayChoice& b) {
    return a.file == b.file && a.speed == b.speed && a.loop == b.loop && a.technology == b.technology;
}

bool same(const ModemManagerChoice& a, const ModemManagerChoice& b) {
    return a.modem == b.modem && a.sim == b.sim;
}

template <class Choice>
void expectAgain(const Choice& choice) {
    if constexpr (requires { choice.speed; })
        require(choice.speed >= 0, "no source plays backwards");
    const auto again = parseSource(textOf(choice));
    require(again && std::holds_alternative<Choice>(*again) && same(std::get<Choice>(*again), choice),
            "what was understood can be said again");
}

/// The input is what the command line says of the source.
class SourceStringTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        const auto choice = parseSource({reinterpret_cast<const char*>(input.data()), input.size()});
        if (choice)
            std::visit([](const auto& each) { expectAgain(each); }, *choice);
        else
            require(!choice.reason().empty(), "a source that is refused has a reason");
    }
};

} // namespace

std::unique_ptr<FuzzTarget> makeSourceStringTarget() {
    return std::make_unique<SourceStringTarget>();
}

} // namespace velmora
