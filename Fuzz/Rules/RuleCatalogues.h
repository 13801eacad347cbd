// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Fuzz/Decoders/DecoderSession.h"
#include "LogGenerator/LogGenerator.h"
#include "Tests/Support/FakeClock.h"

#include <memory>
#include <vector>

namespace velmora {

/// The catalogues of all technologies, which rules are checked against.
class RuleCatalogues {
public:
    RuleCatalogues() {
        const ShippedTemplates templates;
        for (const FuzzedTechnology& technology : fuzzedTechnologies) {
            _decoders.push_back(
                LogGenerator::generatorFromTechnology(std::string(technology.constant), _clock));
            _all.push_back(&_decoders.back()->catalogue());
        }
    }

    [[nodiscard]] const std::vector<const Catalogue*>& all() const { return _all; }

private:
    FakeClock _clock;
    std::vector<std::unique_ptr<LogGenerator>> _decoders;
    std::vector<const Catalogue*> _all;
};

} // namespace velmora
