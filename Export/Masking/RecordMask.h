// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Masking/KnownRegions.h"
#include "Export/Masking/MaskReport.h"
#include "Export/Masking/Pseudonyms/Pseudonyms.h"
#include "LogGenerator/Fields/Meaning.h"

#include <cstdint>
#include <set>
#include <span>
#include <unordered_map>
#include <vector>

namespace velmora {

class Catalogue;

/// Masks the binary records of one technology's own codes, in place: fields that identify get pseudonyms of
/// their width, bytes that no field is read from become 0.
class RecordMask {
public:
    /// What it refers to must outlive it, but for the catalogue.
    RecordMask(const Catalogue& catalogue, const MaskOptions& options, Pseudonyms& pseudonyms,
               MaskReport& report);

    /// Whether it is known what decoders read of records of that code.
    [[nodiscard]] bool knows(std::uint32_t code) const {
        return !_refused.contains(code) && (_layouts.contains(code) || !knownRegionsOf(code).empty());
    }
    /// Whether anything has changed. `record` begins with its header, which is left alone. Precondition:
    /// `knows(code)`.
    bool mask(std::uint32_t code, std::span<std::uint8_t> record);

private:
    struct IdentityField {
        Place place;
        Masked what;
        PseudonymKind kind;
        unsigned bits; ///< that its values have
    };
    struct RecordLayout {
        std::vector<std::uint8_t>
            known; ///< the bits that fields are read from, from the record's first byte on
        std::vector<IdentityField> identities;
        std::span<const KnownRegion> regions;
    };

    void add(const Catalogue& catalogue);
    [[nodiscard]] static IdentityField fieldAt(std::uint32_t code, const Place& place, Identity identity);
    [[nodiscard]] std::uint64_t pseudonym(const IdentityField& field, std::uint64_t value);
    [[nodiscard]] bool isMasked(Masked what) const {
        return what == Masked::Location ? _options.masksAreas() : _options.masksIdentities();
    }
    bool maskIdentities(const RecordLayout& layout, std::span<std::uint8_t> record);
    bool maskNetworks(std::uint32_t code, std::span<std::uint8_t> record);
    bool clearUnknown(const RecordLayout& layout, std::span<std::uint8_t> record);

    const MaskOptions& _options;
    Pseudonyms& _pseudonyms;
    MaskReport& _report;
    std::unordered_map<std::uint32_t, RecordLayout> _layouts;
    /// Codes with an identity that is computed in a way that is not known here: nothing of them may stay.
    std::set<std::uint32_t> _refused;
    std::vector<std::uint8_t> _known; ///< of the current record
};

} // namespace velmora
