// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Fields/Field.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/Damage.h"
#include "Platform/Bytes.h"
#include "Platform/Clock.h"

#include <cstdint>
#include <optional>
#include <span>
#include <string>
#include <string_view>

namespace velmora {

/// One value that a log message reported.
struct Observation {
    /// What its display text is made from.
    enum class Text : std::uint8_t { OfRaw, OfReal, Given };

    const CatalogueField* leaf = nullptr;
    const CatalogueSource* source = nullptr; ///< null for a value that no table describes
    ObservedKind kind = ObservedKind::Absent;
    Text text = Text::Given;
    double number = 0;        ///< the physical value of a number, in the leaf's unit
    double shown = 0;         ///< the number that a real format shows
    std::int64_t raw = 0;     ///< as the record holds it, of a number, an enumeration or a flag
    std::string_view words{}; ///< the value of a text
    std::string_view given{}; ///< what is shown, where it is given
    Bytes bytes{};

    /// The rows that lead to it, the outermost first: the index or, in a numbered list, the entry's own
    /// number.
    std::span<const std::uint32_t> rows{};
    std::string_view rowKey{}; ///< what identifies the row: "62", "6300/17"; empty where only its index does

    /// Its place in the display: "/GSM/Neighboring Cells/0/RSSI".
    void appendPath(std::string& path) const;
};

/// Makes the display texts of observations.
class ObservedText {
public:
    /// Valid until the next call, and no longer than the observation.
    [[nodiscard]] std::string_view of(const Observation& observation);

private:
    // Kept, so that their storage is not initialized for each text.
    std::optional<FormattedText> _formatted;
    NumberText _number;
};

/// A list that a message replaced, with however many rows.
struct ObservedList {
    const Catalogue::Node* list;
    std::uint32_t rows;
};

/// What a log message reported. Valid during the call that passes it.
struct ObservedMessage {
    std::uint64_t number; ///< of the message, from 1, of those that arrived since there is a sink
    Time arrival;         ///< by the decoder's clock
    /// By which the record was routed, 0xFF0000 added for the extra stream; absent for a message that was
    /// dropped or is no record.
    std::optional<std::uint32_t> code;
    /// The modem's own time stamp, as the record holds it; absent where there is none.
    std::optional<std::uint64_t> timestamp;
    std::span<const Observation> observations; ///< in the order in which the display shows them, by section
    std::span<const ObservedList> lists;
    /// Leaves that show nothing any more.
    std::span<const CatalogueField* const> removed;
    Damage damage = Damage::None; ///< the first that the decoder found; what is readable was observed
};

/// Gets what each message reported, when it has been decoded. Called for every message.
class ObservationSink {
public:
    virtual ~ObservationSink() = default;
    virtual void observed(const ObservedMessage& message) = 0;

    /// Whether it uses what is observed of the leaf: others need not be observed. It is asked when it is set
    /// as the sink, or when messages name the leaf later. By default it uses all.
    [[nodiscard]] virtual bool wants(const CatalogueField& /*leaf*/) const { return true; }
    /// Whether it uses `Observation::rowKey`, which is empty otherwise. By default it does.
    [[nodiscard]] virtual bool wantsRowKeys() const { return true; }
};

} // namespace velmora
