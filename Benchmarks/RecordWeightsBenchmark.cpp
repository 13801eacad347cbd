// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogMessages/LogMessage.h"
#include "Telephony/Drives/ScenarioRegistry.h"
#include "Tests/Recording/ChainErrors.h"

#include <algorithm>
#include <charconv>
#include <cstdio>
#include <cstring>
#include <iterator>
#include <string>
#include <string_view>
#include <vector>

// The error rates of RecordChain's weights, as the tables of Documentation/record-chain.md show them: the
// weights as they are, by form and damage, and each weight changed by itself. Usage: record-weights [COUNT],
// COUNT damages for each drive, form and kind of damage.

namespace velmora {
namespace {

constexpr std::string_view drives[] = {"gsm", "lte", "utran", "c2k"};
constexpr std::size_t messagesOfDrive = 3000;
constexpr std::size_t noiseBytes = std::size_t{1} << 20;

using Drive = std::vector<Data>;

Drive driveOf(std::string_view name, std::uint64_t seed) {
    const auto scenario = scenarioKindNamed(name)->make(seed);
    Drive drive;
    while (drive.size() < messagesOfDrive)
        drive.push_back(scenario->next().message);
    return drive;
}

/// The drive as a modem reports it that has no time yet: all time stamps are 0.
Drive withoutTimes(const Drive& drive) {
    Drive timeless;
    for (const Data& message : drive) {
        std::vector<std::uint8_t> bytes(message.bytes().begin(), message.bytes().end());
        const auto parsed = LogMessage::parse(message.bytes());
        if (parsed && parsed->timestamp()) {
            const std::size_t record = message.size() - parsed->record.size();
            const auto begin =
                bytes.begin() + static_cast<std::ptrdiff_t>(record + LogMessage::timestampOffset);
            std::fill_n(begin, LogMessage::headerLength - LogMessage::timestampOffset, std::uint8_t{0});
        }
        timeless.push_back(Data(std::move(bytes)));
    }
    return timeless;
}

ChainErrors measureAll(const std::vector<Drive>& all, ChainForm form, ChainDamage damage, std::size_t count,
                       const RecordWeights& weights) {
    std::mt19937_64 random(1); // the same damages for all weights
    ChainErrors errors;
    for (const Drive& drive : all)
        errors += measureChain(drive, form, damage, count, weights, random);
    return errors;
}

ChainErrors measureEverything(const std::vector<Drive>& all, std::size_t count,
                              const RecordWeights& weights) {
    ChainErrors errors;
    for (const ChainForm form : everyChainForm)
        for (const ChainDamage damage : everyChainDamage)
            errors += measureAll(all, form, damage, count, weights);
    return errors;
}

std::size_t inventedInNoise(const RecordWeights& weights) {
    std::mt19937_64 random(2);
    return measureNoise(noiseBytes, RecordChain::Layout::RawMessages, weights, random).invented +
           measureNoise(noiseBytes, RecordChain::Layout::DLF, weights, random).invented;
}

/// A row of a table: per thousand damages.
void printRow(const std::string& name, const ChainErrors& errors) {
    const double thousands = static_cast<double>(errors.damages) / 1000;
    std::printf("| %s | %zu | %.1f | %.1f |", name.c_str(), errors.damages,
                static_cast<double>(errors.lost) / thousands,
                static_cast<double>(errors.invented) / thousands);
}

void printByDamage(const std::vector<Drive>& all, std::size_t count) {
    constexpr const char* forms[] = {"raw material", "application's log", "compact log"};
    constexpr const char* damages[] = {"none", "bit", "overwritten", "zeroed", "deleted", "inserted"};
    std::puts("| form, damage | runs | lost per 1000 | invented per 1000 |\n|---|---:|---:|---:|");
    for (const ChainForm form : everyChainForm) {
        for (const ChainDamage damage : everyChainDamage) {
            // Errors are rarer without damage.
            const bool isWhole = damage == ChainDamage::None;
            const std::size_t runs = isWhole ? 30 * count : count;
            ChainErrors errors = measureAll(all, form, damage, runs, {});
            if (isWhole)
                errors.damages = all.size() * runs;
            printRow(std::string(forms[static_cast<int>(form)]) + ", " + damages[static_cast<int>(damage)],
                     errors);
            std::puts("");
        }
    }
}

struct Weight {
    const char* name;
    int RecordWeights::*member;
};
constexpr Weight everyWeight[] = {
    {"type", &RecordWeights::type},
    {"prefix", &RecordWeights::prefix},
    {"wantedCode", &RecordWeights::wantedCode},
    {"nearTimestamp", &RecordWeights::nearTimestamp},
    {"zeroAmongZeros", &RecordWeights::zeroAmongZeros},
    {"zeroAmongTimes", &RecordWeights::zeroAmongTimes},
    {"farTimestamp", &RecordWeights::farTimestamp},
    {"badTimestamp", &RecordWeights::badTimestamp},
    {"endOfInput", &RecordWeights::endOfInput},
    {"goodFollower", &RecordWeights::goodFollower},
    {"expected", &RecordWeights::expected},
    {"sure", &RecordWeights::sure},
};

void printByWeight(const std::vector<Drive>& all, std::size_t count) {
    std::puts("| weight | damages | lost per 1000 | invented per 1000 | invented in 2 MiB of noise |\n"
              "|---|---:|---:|---:|---:|");
    const auto print = [&](const std::string& name, const RecordWeights& weights) {
        printRow(name, measureEverything(all, count, weights));
        std::printf(" %zu |\n", inventedInNoise(weights));
    };
    print("as they are", {});
    for (const Weight& weight : everyWeight) {
        for (const int step : {-8, -4, 4, 8}) {
            RecordWeights changed;
            changed.*weight.member += step;
            print(std::string(weight.name) + " " + std::to_string(changed.*weight.member), changed);
        }
    }
}

int run(int count, char** arguments) {
    std::size_t damages = 20;
    if (count == 2) {
        const char* const end = arguments[1] + std::strlen(arguments[1]);
        if (std::from_chars(arguments[1], end, damages).ptr != end)
            damages = 0;
    }
    if (count > 2 || damages == 0) {
        std::fputs("usage: record-weights [COUNT]\n", stderr);
        return 2;
    }
    std::vector<Drive> all;
    for (const std::string_view name : drives)
        for (const std::uint64_t seed : {1, 2, 3, 4, 5})
            all.push_back(driveOf(name, seed));
    std::vector<Drive> timeless;
    std::transform(all.begin(), all.end(), std::back_inserter(timeless), withoutTimes);
    for (const auto* each : {&all, &timeless}) {
        std::puts(each == &all ? "Records with time stamps:\n" : "\nRecords whose time stamps are 0:\n");
        printByDamage(*each, damages);
        std::puts("");
        printByWeight(*each, damages);
    }
    return 0;
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    return velmora::run(count, arguments);
}
