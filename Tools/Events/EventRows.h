// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Events/EventWriter.h"
#include "Tools/Text/CSVText.h"

namespace velmora {

/// Comma-separated values, a row for each event.
class EventRows final : public EventWriter {
public:
    /// `names` must outlive it.
    EventRows(Output& output, const EvidenceNames& names, CSVGuard guard)
        : EventWriter(output), _names(names), _guard(guard) {}

    void begin() override;

private:
    void append(const Event& event, EventState state) override;
    /// A cell after its comma; empty where the event has no such field.
    void appendField(const Event& event, std::string_view name);
    void appendOthers(const Event& event);
    void appendEvidence(const Event& event);

    const EvidenceNames& _names;
    CSVGuard _guard;
};

} // namespace velmora
