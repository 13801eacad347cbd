// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Fuzz/CorpusTools.h"
#include "Fuzz/FuzzCorpora.h"
#include "Fuzz/FuzzTargets.h"
#include "Recording/Positions/FixAssembler.h"
#include "Recording/Positions/NMEAWriter.h"
#include "Recording/Positions/TrackFile.h"
#include "Tests/Support/Fixes.h"

#include <algorithm>
#include <chrono>
#include <cmath>
#include <string_view>

namespace velmora {

namespace {

/// How far a place moves when it is written as a sentence: half of the last decimal of a minute.
constexpr double writtenError = 1.0 / 60 / 100'000;

void checkFix(const Fix& fix) {
    require(std::abs(fix.latitude) <= 90, "a latitude is at most 90 degrees");
    require(fix.longitude >= -180 && fix.longitude < 180, "a longitude is from -180 to below 180 degrees");
    require(!fix.speed_mps || *fix.speed_mps >= 0, "a speed is not negative");
    require(!fix.course_degrees || (*fix.course_degrees >= 0 && *fix.course_degrees < 360),
            "a course is from 0 to below 360 degrees");
    require(!fix.hdop || *fix.hdop > 0, "a dilution is positive");
    require(!fix.deviation_m || *fix.deviation_m >= 0, "a deviation is not negative");
}

/// What is written of a fix is read again.
void checkWritten(const Fix& fix) {
    FixAssembler assembler;
    for (const std::string& sentence : nmeaSentences(fix))
        static_cast<void>(assembler.add({fix.time, sentence}));
    require(assembler.damaged() == 0, "no written sentence is damaged");
    const std::optional<Fix> read = assembler.finish();
    require(read.has_value(), "a written fix is read");
    require(std::abs(read->latitude - fix.latitude) <= writtenError, "a latitude is read as written");
    require(std::abs(std::remainder(read->longitude - fix.longitude, 360)) <= writtenError,
            "a longitude is read as written");
}

/// The input is a track file, and sentences, a line each, that come a tenth of a second apart.
class PositionTarget final : public FuzzTarget {
public:
    void run(Bytes input) override {
        const std::string_view text(reinterpret_cast<const char*>(input.data()), input.size());
        if (const Result<std::vector<Fix>> fixes = fixesOfTrackFile(text)) {
            require(!fixes->empty(), "a track has fixes");
            Time last = Time::min();
            for (const Fix& fix : *fixes) {
                checkFix(fix);
                require(fix.time >= last, "the fixes of a track are in order");
                last = fix.time;
            }
        }
        FixAssembler assembler;
        Time time;
        for (std::string_view rest = text; !rest.empty(); time += std::chrono::milliseconds(100)) {
            const std::size_t end = std::min(rest.find('\n'), rest.size());
            take(assembler.add({time, rest.substr(0, end)}));
            rest.remove_prefix(std::min(end + 1, rest.size()));
        }
        take(assembler.finish());
    }

private:
    static void take(const std::optional<Fix>& fix) {
        if (!fix)
            return;
        checkFix(*fix);
        // What no receiver reports need not fit into a sentence.
        if (std::abs(fix->altitude_m.value_or(0)) < 1e6 && fix->speed_mps.value_or(0) < 1e6 &&
            fix->hdop.value_or(1) < 99 && fix->deviation_m.value_or(0) < 1e6)
            checkWritten(*fix);
    }
};

} // namespace

std::unique_ptr<FuzzTarget> makePositionTarget() {
    return std::make_unique<PositionTarget>();
}

FuzzCorpus positionCorpus() {
    FuzzCorpus corpus;
    Fix fix = fixAt(std::chrono::seconds(1'794'805'200), -33.5, 151.25);
    fix.altitude_m = 12.5;
    fix.speed_mps = 23;
    fix.course_degrees = 37.25;
    fix.hdop = 0.9;
    fix.deviation_m = 2.8;
    std::string lines;
    for (int second = 0; second < 2; ++second, fix.time += std::chrono::seconds(1))
        for (const std::string& sentence : nmeaSentences(fix))
            lines += sentence;
    corpus.seeds.push_back(textData(lines));
    for (const std::string_view content :
         {"GNGNS,123520.50,4807.050,N,01131.010,E,AN,08,0.7,546.0,47.0,,",
          "GLGLL,4807.038,S,01131.000,W,123521,A,A", "GPVTG,054.7,T,034.4,M,005.5,N,010.2,K,A",
          "GNGSA,A,3,04,05,,09,12,,,24,,,,,2.5,1.3,2.1", "GPZDA,123521,22,11,2026,00,00"})
        corpus.seeds.push_back(textData(nmeaSentence(content)));
    corpus.seeds.push_back(
        textData("<gpx version=\"1.1\"><trk><trkseg><trkpt lat=\"59.33\" lon=\"18.06\"><ele>12</ele>"
                 "<time>2026-11-22T09:05:07.25Z</time><hdop>0.9</hdop><extensions><a:speed>23"
                 "</a:speed></extensions></trkpt></trkseg></trk></gpx>"));
    for (const char* const token :
         {"$GPGGA,", "$GNRMC,", "*", "\r\n", "<trkpt lat=\"", "<time>", "99.99", "18000.0,E"})
        corpus.tokens.push_back(textData(token));
    return corpus;
}

} // namespace velmora
