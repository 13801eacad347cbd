// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Events/EventWriter.h"

namespace velmora {

/// One JSON object a line for each event.
class EventLines final : public EventWriter {
public:
    /// `names` must outlive it.
    EventLines(Output& output, const EvidenceNames& names) : EventWriter(output), _names(names) {}

private:
    void append(const Event& event, EventState state) override;
    void appendFields(const Event& event);
    void appendEvidence(const Event& event);

    const EvidenceNames& _names;
};

} // namespace velmora
