// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/Detectors/LeafRows.h"
#include "Analysis/Engine/Detector.h"
#include "Analysis/Picture/Technologies/DetectorTable.h"

#include <span>
#include <string>
#include <vector>

namespace velmora {

/// Reports packet-data contexts that become active, have another address, or are not active any more. The
/// first list of contexts that is seen is what there is.
class ContextsDetector final : public Detector {
public:
    /// A phone has at most 11 (3GPP TS 24.008 10.5.6.2); further ones of a message are left out.
    static constexpr std::size_t most = 64;

    /// What the first list has: no events, or contexts that have become active.
    enum class AtStart : bool { Known, Events };

    ContextsDetector(const Catalogue& catalogue, const DetectorTable& table, AtStart atStart = AtStart::Known)
        : _table(table.contexts), _leaves(catalogue), _isKnown(atStart == AtStart::Events) {}

    [[nodiscard]] bool wants(const CatalogueField& leaf) const override;
    void report(const MessageReport& report, const RadioPicture& picture, EventSink& sink) override;
    /// Whether there has been a list.
    [[nodiscard]] bool hasRead() const { return _hasRead; }
    void interrupt(Time last, EventSink& sink) override;

private:
    struct Context {
        std::uint32_t row = 0;
        std::string key;
        std::string address; ///< all of them, separated by blanks
        bool isConnected = true;
        Time since{};
        bool isSinceKnown = false;
        MessageNumber message; ///< that reported it first
    };

    [[nodiscard]] bool hasList(const ObservedMessage& message) const;
    void readList(const ObservedMessage& message);
    void read(const Observation& observation);
    [[nodiscard]] Context& at(std::uint32_t row);
    void compare(const MessageReport& report, const RadioPicture& picture, EventSink& sink);
    void happened(EventKind kind, const Context& context, const MessageReport& report,
                  const RadioPicture& picture, EventSink& sink) const;
    /// How many parts of a context the table has, and whether leaves of that path are one of them.
    [[nodiscard]] std::size_t parts() const;
    [[nodiscard]] bool isOfPart(std::string_view path, std::size_t part) const;

    ContextTable _table;
    LeafRows _leaves;
    bool _isKnown;
    bool _hasRead = false;
    std::vector<Context> _active;
    std::vector<Context> _new; ///< of this message; the storage is used again
    std::size_t _count = 0;    ///< of those in use
    ObservedText _texts;
};

} // namespace velmora
