// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/CorpusTools.h"
#include "Fuzz/FuzzCorpora.h"
#include "Tests/Support/ShippedResources.h"

#include <string>
#include <string_view>

namespace velmora {

namespace {

constexpr std::string_view words[] = {
    "serving.level",
    "serving.quality",
    "neighbour.level",
    "neighbour.detected",
    "radio.technology",
    "radio.state",
    "data-rate",
    "age(",
    "delta(",
    "count(",
    "changed(",
    "known(",
    "max(",
    "any(",
    " and ",
    " or ",
    "not ",
    " in ",
    "..",
    "==",
    "<",
    "dBm",
    "dB",
    " 5 s",
    "'/UMTS/Active Set/*/RSCP'",
    "'/SIM'",
    "'LTE'",
    "-110",
    "0.5",
    "[[rule]]\n",
    "[[rule.test]]\n",
    "name = ",
    "when = ",
    "for = ",
    "clear = ",
    "keep = ",
    "text = ",
    "severity = ",
    "technology = ",
    "lasts = false",
    "values = [",
    "events = [",
    "{ at = 1, ",
    "begin = 1",
    "neighbours = [",
    "unknown = [",
    "interruption = true",
    "\"\"\"",
    "'''",
    "{serving.level}",
    "\\u0041",
};

} // namespace

FuzzCorpus ruleExpressionCorpus() {
    constexpr std::string_view seeds[] = {
        "serving.level < -110 dBm",
        "radio.technology in ('LTE', 'NR') and serving.quality <= -15",
        "count(neighbour.level > serving.level - 5 dB) >= 3 or neighbour.detected",
        "delta(serving.level, 5s) < -10 dB and age(serving.level) < 3 s",
        "count(changed(serving.cell), 1 min) >= 2",
        "max('/UMTS/Active Set/*/RSCP') - min('/UMTS/Active Set/*/RSCP') > 3",
        "not ('/UMTS/UMTS RR Info/Ciphering' or known(radio.state)) and serving.channel in 1..3",
        "(data-rate / 1 Mbit/s * 2 - 1) != -abs(0.5)",
    };
    return {textDatas(seeds), textDatas(words)};
}

FuzzCorpus ruleFileCorpus() {
    constexpr std::string_view seeds[] = {
        "[[rule]]\nname = \"weak\"\nwhen = \"serving.level < -110\"\nfor = \"5s\"\nkeep = 2\nseverity = "
        "\"info\"\n"
        "text = \"{serving.level}\"\n[[rule.test]]\nvalues = [{ at = 1, serving.level = -111 }, { at = 7 }]\n"
        "events = [{ begin = 1 }]\n",
        "[[rule]]\nname = \"a\"\nlasts = false\ntechnology = [\"LTE\", \"Modem\"]\ntext = '''{{}}'''\n"
        "when = '''\nchanged(serving.cell)\nor age(serving.level) > 3'''\nclear = \"known(serving.level)\"\n",
        "[[rule]]\nname = \"n\"\nwhen = \"any(neighbour.detected)\"\ntext = \"\"\n[[rule.test]]\ntechnology "
        "= "
        "\"LTE\"\nvalues = [{ at = 0, neighbours = [{ level = -1, detected = true }] },\n"
        "{ at = 1, interruption = true, unknown = [\"serving.level\"] }]\nevents = []\n",
    };
    FuzzCorpus corpus{textDatas(seeds), textDatas(words)};
    for (const std::string_view file : {"rules/coverage.toml", "rules/transfer.toml"})
        corpus.seeds.push_back(shippedResource(file));
    return corpus;
}

} // namespace velmora
