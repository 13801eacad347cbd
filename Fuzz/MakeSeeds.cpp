// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// make-seeds DIRECTORY: what the fuzzers start from. For every target a directory of its name with an input a
// file, and NAME.dict with its words as the fuzzing engine reads them. Prints the targets' names and how long
// their inputs get.

#include "Fuzz/FuzzTargets.h"
#include "Fuzz/QuietProcess.h"

#include <cstdio>
#include <filesystem>
#include <fstream>
#include <stdexcept>
#include <string>

namespace velmora {
namespace {

namespace fs = std::filesystem;

std::ofstream create(const fs::path& path) {
    std::ofstream file(path, std::ios::binary | std::ios::trunc);
    if (!file)
        throw std::runtime_error("cannot write " + path.string());
    return file;
}

std::string escaped(Bytes token) {
    std::string text;
    for (const std::uint8_t byte : token) {
        char digits[8];
        std::snprintf(digits, sizeof digits, "\\x%02X", static_cast<unsigned>(byte));
        text += digits;
    }
    return text;
}

void write(const FuzzTargetKind& target, const fs::path& directory) {
    const fs::path seeds = directory / target.name;
    fs::remove_all(seeds);
    fs::create_directories(seeds);
    const FuzzCorpus corpus = target.corpus();
    std::size_t number = 0;
    for (const Data& seed : corpus.seeds) {
        if (seed.size() > target.maximumLength)
            continue; // the tests go through those; the engine would cut them in the middle
        const Bytes bytes = seed.bytes();
        create(seeds / std::to_string(++number))
            .write(reinterpret_cast<const char*>(bytes.data()), static_cast<std::streamsize>(bytes.size()));
    }
    std::ofstream dictionary = create(directory / std::string(target.name).append(".dict"));
    for (const Data& token : corpus.tokens)
        dictionary << '"' << escaped(token.bytes()) << "\"\n";
    std::printf("%.*s %zu\n", static_cast<int>(target.name.size()), target.name.data(), target.maximumLength);
}

} // namespace
} // namespace velmora

int main(int count, char** arguments) {
    if (count != 2) {
        std::fputs("Usage: make-seeds DIRECTORY\n", stderr);
        return 2;
    }
    try {
        const velmora::QuietProcess quiet;
        for (const velmora::FuzzTargetKind& target : velmora::fuzzTargets())
            velmora::write(target, arguments[1]);
    } catch (const std::exception& error) {
        std::fprintf(stderr, "make-seeds: %s\n", error.what());
        return 1;
    }
    return 0;
}
