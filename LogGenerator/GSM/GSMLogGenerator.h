// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "Platform/TelephonyService.h"

namespace velmora {

/// The decoder of the serialized-object stream: each log message is one property list that already holds the
/// display as a tree of dictionaries, arrays and strings. It is simplified and becomes the display; nothing
/// of the earlier message is kept.
class GSMLogGenerator final : public LogGenerator {
public:
    using LogGenerator::LogGenerator;
    [[nodiscard]] static std::unique_ptr<GSMLogGenerator> generator(const Clock& clock);

    [[nodiscard]] std::string_view technology() const override { return kVoxLogChannelTechnology_IFX; }
    /// Raises AssertionFailure for a message that is no property list or holds any other kind of value.
    void updateState(Dictionary& state, const Data& data) override;
    [[nodiscard]] Value generateLogUsingState(Dictionary& state) override;
    [[nodiscard]] DictionaryRef getStartCommand() const override;
    [[nodiscard]] ArrayRef getSaveContentsFromState(const Dictionary& state) const override;

    /// The tree with every dictionary below the root that has exactly one entry replaced by that entry's
    /// value. Works from the bottom up, so that chains of them fold completely; the root stays what it is.
    [[nodiscard]] static Value processObject(const Value& object);

    /// The single value of a dictionary with exactly one entry, none for anything else.
    [[nodiscard]] Value canCollapse(const Value& object) const;

protected:
    /// The leaves that are known; what else the trees hold is added when it is first seen.
    void describe(Catalogue& catalogue) override;
};

} // namespace velmora
