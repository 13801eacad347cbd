// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Observation.h"
#include "Tests/LogGenerator/Observations/ShownDisplay.h"

#include <map>
#include <set>
#include <string>
#include <vector>

namespace velmora {

/// Compares what a decoder observes of each message with what the display shows of it, text for text and leaf
/// for leaf. Use: `mark`, decode one message, `problems`.
class DisplayCheck final : public ObservationSink {
public:
    /// The decoder's sink from now on, for as long as this lives. The decoder must outlive it.
    explicit DisplayCheck(LogGenerator& decoder);
    ~DisplayCheck() override;

    /// Replaces everything that the display shows, so that whatever a message writes is seen, even where it
    /// is what was there before.
    void mark(Dictionary& state);
    /// Where the observations of the message and the display differ.
    [[nodiscard]] std::vector<std::string> problems(Dictionary& state);

    /// What has been observed so far: the sources of the leaves, and the leaves themselves.
    [[nodiscard]] const std::set<const CatalogueSource*>& sources() const { return _sources; }
    [[nodiscard]] const std::set<const CatalogueField*>& leaves() const { return _leaves; }

    void observed(const ObservedMessage& message) override;

private:
    struct Seen {
        std::string text;
        std::string rowKey;
        const CatalogueField* leaf;
        const CatalogueSource* source;
    };

    void expectShown(const ShownDisplay& shown);
    void expectObserved(const ShownDisplay& shown);
    void expectLists(const ShownDisplay& shown);
    void expectRowKeys(const ShownDisplay& shown);
    void expectRemoved(const ShownDisplay& shown);

    LogGenerator& _decoder;
    const bool _isDictionaryOfValues;               ///< whose lists are dictionaries by number
    std::map<std::string, std::string> _marked;     ///< the pattern by the path
    std::map<std::string, std::vector<Seen>> _seen; ///< by path, in the order of the observations
    std::map<std::string, std::vector<std::size_t>> _lists;
    std::set<std::string> _removed;
    std::vector<std::string> _problems;
    std::set<const CatalogueSource*> _sources;
    std::set<const CatalogueField*> _leaves;
};

} // namespace velmora
