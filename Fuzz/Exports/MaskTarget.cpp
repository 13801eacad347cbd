// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Masking/MaskedRecording.h"
#include "Export/Masking/MessageMask.h"
#include "Export/Masking/TechnologyName.h"
#include "Fuzz/FuzzTargets.h"
#include "Platform/TelephonyService.h"
#include "Recording/OpenMessages.h"
#include "Tests/Recording/PcapngFile.h"
#include "Tests/Support/FakeResources.h"
#include "Tests/Support/ShippedResources.h"

#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

namespace {

class MemoryFile final : public OutputFile {
public:
    explicit MemoryFile(std::vector<std::uint8_t>& bytes) : _bytes(bytes) {}
    Written write(Bytes bytes) override {
        _bytes.insert(_bytes.end(), bytes.begin(), bytes.end());
        return {bytes.size(), 0};
    }
    [[nodiscard]] bool isRegular() const override { return false; }
    int truncateTo(std::uint64_t) override { return 0; }
    void startSync() override {}
    std::optional<int> takeSyncResult() override { return std::nullopt; }
    int sync() override { return 0; }
    int close() override { return 0; }

private:
    std::vector<std::uint8_t>& _bytes;
};

/// Any file is masked or refused, what comes out can be read without a loss, and masking that again changes
/// nothing. It is never larger than twice the input, apart from what every recording begins and ends with.
/// The first byte selects the level and the technology of a file that names none.
class MaskTarget final : public FuzzTarget {
public:
    MaskTarget() {
        for (const char* const name : {"Ostrel_GSM", "LTE", "Ostrel_UTRAN", "C2KTemplate", "Modem"})
            _resources.put(name, "plist", shippedResource(std::string(name) + ".plist"));
    }

    void run(Bytes input) override {
        if (input.empty())
            return;
        const auto level = static_cast<MaskLevel>(input[0] % 3);
        const std::string_view technology =
            shortTechnologyName(voxTechnologies[input[0] / 3 % voxTechnologies.size()]);
        const Data file = Data::copyOf(input.subspan(1));
        MaskOptions options{{}, level};
        const std::vector<std::uint8_t> once = masked(file, options, technology);
        if (once.empty())
            return;
        constexpr std::size_t ends = 1024;
        require(!_isRecording || once.size() <= 2 * file.size() + ends,
                "a masked recording is at most twice as large");
        options.done = level;
        const std::vector<std::uint8_t> twice = masked(Data::copyOf(once), options, technology);
        require(_losses == 0, "a masked file can be read");
        require(twice == once, "masking twice changes nothing");
    }

private:
    /// Empty where it is refused.
    std::vector<std::uint8_t> masked(const Data& file, const MaskOptions& options,
                                     std::string_view otherwise) {
        std::vector<std::uint8_t> bytes;
        const auto reader = openMessages(ChunkedInput(std::make_unique<MemorySource>(file)));
        if (!reader)
            return bytes;
        (*reader)->setReadsAllTechnologies(true);
        MaskedRecording recording(std::make_unique<MemoryFile>(bytes), "memory",
                                  {options.level, options.key.fingerprint(), {}});
        MessageMask mask(options);
        _isRecording = (*reader)->form() == "recording";
        while (const auto message = (*reader)->next()) {
            const std::string named = technologyOf(*message, **reader);
            const std::string name = isTechnology(named) ? named : std::string(otherwise);
            if (const auto each = mask.mask(*message, name))
                require(bool(recording.add(each->time, each->message.bytes(), name)),
                        "memory can be written");
        }
        _losses = (*reader)->lossTotals().losses;
        require(bool(recording.finish(otherwise)), "memory can be written");
        return bytes;
    }

    FakeResources _resources;
    bool _isRecording = false;
    std::uint64_t _losses = 0;
};

} // namespace

std::unique_ptr<FuzzTarget> makeMaskTarget() {
    return std::make_unique<MaskTarget>();
}

} // namespace velmora
