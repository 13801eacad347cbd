// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Events/EventWriter.h"

#include <functional>
#include <string>
#include <utility>

namespace velmora {

/// A field's value: the shortest number that reads back as the same, "true", "false", or the text.
[[nodiscard]] std::string textOf(const EventField::Value& value);

/// The messages that made the event: "12 15" of one file or the service, "a.pcapng:12 b.pcapng:3" of several.
[[nodiscard]] std::string evidenceText(const Event& event, const EvidenceNames& names);

/// Aligned columns for people: time, duration, severity, kind, the technology where there are several,
/// and the text.
class EventText final : public EventWriter {
public:
    struct Columns {
        bool hasEvidence = false; ///< at the end of each line
        bool hasPlace = false;    ///< before the text
    };

    /// `names` must outlive it. `hasSeveralTechnologies`: whether there have been several so far.
    EventText(Output& output, const EvidenceNames& names, Columns columns,
              std::function<bool()> hasSeveralTechnologies)
        : EventWriter(output), _names(names), _columns(columns),
          _hasSeveralTechnologies(std::move(hasSeveralTechnologies)) {}

private:
    void append(const Event& event, EventState state) override;
    /// The text, filled up with blanks to that many columns, and two more.
    void appendPadded(std::string_view text, std::size_t columns);

    const EvidenceNames& _names;
    Columns _columns;
    std::function<bool()> _hasSeveralTechnologies;
};

} // namespace velmora
