// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/MaskOption.h"

#include "Export/Masking/Sealing/SealedFile.h"
#include "Recording/Files/ChunkedInput.h"
#include "Recording/OpenMessages.h"
#include "Tools/CommandOptions.h"
#include "Tools/Mask/KeyFile.h"

#include <algorithm>
#include <filesystem>
#include <memory>
#include <system_error>

namespace velmora {

namespace {

/// What a flag without a value is.
constexpr const char* noValue = "true";

} // namespace

void addMaskOption(CLI::App& command, MaskOption& option) {
    CLI::Option* const mask = command.add_flag("--mask");
    mask->description("Mask messages before they are decoded; --mask=location and --mask=all mask more");
    mask->check(validator([](const std::string& name) { return name == noValue || maskLevelNamed(name); },
                          "no value or one of identity, location, all"));
    mask->each([&option](const std::string& name) {
        option.level = maskLevelNamed(name).value_or(MaskLevel::Identity);
    });
    command
        .add_option("--key", option.keyFile,
                    "With --mask, a key that mask --new-key made; the default is a random one")
        ->needs(mask)
        ->type_name("FILE");
}

Result<std::optional<MaskOptions>> maskOptionsOf(const MaskOption& option) {
    if (!option.level)
        return std::optional<MaskOptions>();
    const Result<MaskKey> key = keyFor(option.keyFile);
    if (!key)
        return Failure{key.reason()};
    return std::optional(MaskOptions{*key, *option.level});
}

MaskOptions maskOptionsFor(const std::string& file, MaskOptions options) {
    std::error_code error;
    if (file == "-" || !std::filesystem::is_regular_file(file, error))
        return options;
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(file);
    if (!source)
        return options; // as will be reported
    if (const auto seal = readSeal(ChunkedInput(*std::move(source)));
        seal && seal->key == options.key.fingerprint()) {
        options.done = seal->level;
        options.level = std::max(options.level, seal->level);
    }
    return options;
}

} // namespace velmora
