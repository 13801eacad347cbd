// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/Paths/KnownCatalogues.h"

#include "Tools/Decode/Paths/FileTechnologies.h"
#include "Tools/Decode/Paths/NodeSelection.h"
#include "Tools/Log/QuietConsole.h"
#include "Tools/LogOverride.h"
#include "Tools/Technologies.h"

#include <algorithm>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

class SilentLog final : public LogOverride {
public:
    void write(int, std::string_view) override {}
};

} // namespace

KnownCatalogues::KnownCatalogues(const NodeSelection& selection, const std::string& technology,
                                 const std::vector<std::string>& files, FileTechnologies& technologies) {
    if (selection.paths().empty())
        return;
    if (!technology.empty()) {
        add(technology);
        return;
    }
    for (const std::string& file : files) {
        if (file == "-")
            _areAll = false;
        else
            for (const std::string& each : technologies.of(file))
                add(each);
    }
}

KnownCatalogues::~KnownCatalogues() {
    const SilentLog silence;
    const QuietConsole noConsole;
    _decoders.clear();
}

void KnownCatalogues::add(const std::string& technology) {
    const Result<std::string> constant = technologyNamed(technology);
    if (!constant || std::find(_names.begin(), _names.end(), *constant) != _names.end())
        return;
    const SilentLog silence;
    const QuietConsole noConsole;
    _names.push_back(*constant);
    if (Result<std::unique_ptr<LogGenerator>> decoder = makeDecoder(*constant, _clock)) {
        _catalogues.push_back(&(*decoder)->catalogue());
        _decoders.push_back(*std::move(decoder));
    }
}

} // namespace velmora
