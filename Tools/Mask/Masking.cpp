// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Mask/Masking.h"

#include "Export/Masking/MaskedReader.h"
#include "Export/Masking/MaskedRecording.h"
#include "Export/Masking/Sealing/SealedFile.h"
#include "Platform/Linux/Errno.h"
#include "Platform/Linux/Files/Files.h"
#include "Platform/TelephonyService.h"
#include "PropertyLists/PropertyList.h"
#include "Recording/Files/DescriptorFile.h"
#include "Recording/OpenMessages.h"
#include "Tools/Convert/Conversion.h"
#include "Tools/Messages/TechnologyChoice.h"
#include "Tools/Report.h"
#include "Tools/Technologies.h"

#include <cerrno>
#include <memory>
#include <utility>

#include <fcntl.h>
#include <unistd.h>

namespace velmora {

namespace {

MaskSeal sealOf(const MaskOptions& options) {
    return {options.level, options.key.fingerprint(), {}};
}

Result<bool> toRecording(MessageReader& reader, const TechnologyChoice& choice, MessageMask& mask,
                         const std::string& title, const std::string& name, int descriptor) {
    MaskedRecording recording(std::make_unique<DescriptorFile>(descriptor, false), name,
                              sealOf(mask.options()));
    reader.setReadsAllTechnologies(choice.override.empty());
    recording.addSentencesOf(reader);
    std::vector<std::string> names;
    while (const std::optional<LoggedMessage> read = reader.next()) {
        if (choice.only && read->technology != *choice.only)
            continue;
        if (read->technology >= names.size() || names[read->technology].empty())
            names = reader.technologies();
        const std::string technology = choice.nameOf(read->technology, names);
        if (technology.empty())
            return Failure{title + ": " + technologyNamed(technology).reason() +
                           "; --technology supplies it"};
        const std::optional<LoggedMessage> masked = mask.mask(*read, technology);
        if (!masked)
            continue;
        if (const auto added = recording.add(masked->time, masked->message.bytes(), technology); !added)
            return Failure{added.reason()};
    }
    const std::string first = choice.nameOf(choice.only.value_or(0), reader.technologies());
    if (const Result<std::string> known = technologyNamed(first); !known && mask.report().messages == 0)
        return Failure{title + ": " + known.reason() + (first.empty() ? "; --technology supplies it" : "")};
    if (const auto finished = recording.finish(isTechnology(first) ? first : std::string()); !finished)
        return Failure{finished.reason()};
    return true;
}

Result<Done> sealLog(const AtomicFile& file, MaskSeal seal) {
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(file.path());
    if (!source)
        return Failure{source.reason()};
    seal.digest = digestOfLog(ChunkedInput(*std::move(source)));
    const std::vector<std::uint8_t> bytes = seal.bytes();
    const ::ssize_t written = ::pwrite(file.descriptor(), bytes.data(), bytes.size(), MaskSeal::reportOffset);
    return written == static_cast<::ssize_t>(bytes.size()) ? Result<Done>(Done{}) : Failure{errnoText(errno)};
}

Result<Done> sealSnapshotFile(const AtomicFile& file, MaskSeal seal) {
    constexpr std::size_t largestSnapshot = std::size_t{256} << 20;
    const Result<Data> content = readFile(file.path(), largestSnapshot);
    if (!content)
        return Failure{content.reason()};
    const Result<Value> root = readPropertyList(
        content->bytes(), {.maximumObjects = ~std::size_t{0}, .maximumMemory = ~std::size_t{0}});
    if (!root || !root->asDictionary())
        return Failure{root ? "no dictionary" : root.reason()};
    if (Result<Done> sealed = sealSnapshot(*root, std::move(seal)); !sealed)
        return sealed;
    const Result<std::string> list = writePropertyList(*root);
    if (!list)
        return Failure{list.reason()};
    if (::ftruncate(file.descriptor(), 0) != 0 || ::lseek(file.descriptor(), 0, SEEK_SET) != 0)
        return Failure{errnoText(errno)};
    return writeAll(file.descriptor(),
                    Bytes(reinterpret_cast<const std::uint8_t*>(list->data()), list->size()));
}

} // namespace

Result<bool> maskMessages(MessageReader& reader, const MaskCommandOptions& options, MessageMask& mask,
                          const std::string& title, const AtomicFile& file, WorkContext& context) {
    Conversion conversion;
    conversion.form = *formFromName(options.out);
    conversion.title = title;
    conversion.name = options.out;
    conversion.technology = options.technology;
    if (!options.technology.empty())
        conversion.technologies = technologiesOf(options.file);
    const Result<TechnologyChoice> choice =
        TechnologyChoice::make(options.technology, knownTechnologies(conversion.technologies, reader));
    if (!choice)
        return Failure{title + ": " + choice.reason()};
    if (conversion.form == FileForm::Recording)
        return toRecording(reader, *choice, mask, title, options.out, file.descriptor());
    MaskedReader masked(reader, mask, choice->override, true);
    Result<bool> converted = convertMessages(masked, conversion, file.descriptor(), context);
    if (!converted)
        return converted;
    const MaskSeal seal = sealOf(mask.options());
    if (const auto sealed =
            conversion.form == FileForm::DLFLog ? sealLog(file, seal) : sealSnapshotFile(file, seal);
        !sealed)
        return Failure{options.out + ": " + sealed.reason()};
    return converted;
}

} // namespace velmora
