// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/LogGenerator.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "Platform/Linux/MachineClock.h"

#include <memory>
#include <string>
#include <vector>

namespace velmora {

class FileTechnologies;
class NodeSelection;

/// The catalogues of the technologies that decoding will meet, as far as they are known before: what standard
/// input holds is known from its first message on. Made without a line in the log: the decoders are there for
/// their catalogues alone.
class KnownCatalogues {
public:
    /// None where they are not needed: without a selection. `technology`: the only one; empty for the files'.
    KnownCatalogues(const NodeSelection& selection, const std::string& technology,
                    const std::vector<std::string>& files, FileTechnologies& technologies);
    ~KnownCatalogues();
    KnownCatalogues(const KnownCatalogues&) = delete;
    KnownCatalogues& operator=(const KnownCatalogues&) = delete;

    [[nodiscard]] const std::vector<const Catalogue*>& catalogues() const { return _catalogues; }
    /// Whether standard input may hold others.
    [[nodiscard]] bool areAll() const { return _areAll; }

private:
    void add(const std::string& technology);

    MachineClock _clock;
    std::vector<std::string> _names;
    std::vector<std::unique_ptr<LogGenerator>> _decoders;
    std::vector<const Catalogue*> _catalogues;
    bool _areAll = true;
};

} // namespace velmora
