// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/Extra/CellList.h"

#include <memory>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A technology's registry: section names to sections, and log codes to the sections that want them. A
/// technology's subclass creates its sections, owns them, and does nothing else.
class ClassIndex {
public:
    ClassIndex() = default;
    /// Prints "Deallocing ClassIndex" on the console.
    virtual ~ClassIndex();
    ClassIndex(const ClassIndex&) = delete;
    ClassIndex& operator=(const ClassIndex&) = delete;

    /// The section registered under the name, or null.
    [[nodiscard]] Base* getClass(std::string_view name) const;
    /// The sections that want the code, in calling order; null when none does.
    [[nodiscard]] const std::vector<Base*>* getSubscribers(std::uint32_t code) const;
    /// Every wanted code as a decimal string.
    [[nodiscard]] std::vector<std::string> getAllLogCodes() const;
    /// What the sections read the cell information array with.
    [[nodiscard]] CellList& cellList() const { return *_cellList; }
    /// Two log lines on what kind of object `classDict` is.
    void status() const;

    ClassDictionary classDict;
    CodeDictionary codeDictionary;

protected:
    /// Creates a section in its field and registers it: one line a section in the subclass's constructor.
    template <class Section>
    void create(std::unique_ptr<Section>& field) {
        field = std::make_unique<Section>();
        field->shareCellList(_cellList);
        field->initWithDict(classDict, codeDictionary);
        _routes.clear();
    }

private:
    /// A code of `codeDictionary` and where its sections stand there; null in a place that is free.
    struct Route {
        std::uint32_t code = 0;
        const std::vector<Base*>* subscribers = nullptr;
    };
    void makeRoutes() const;

    std::shared_ptr<CellList> _cellList = std::make_shared<CellList>();
    /// `codeDictionary` as it is looked at for every message: by the code itself, at its remainder or in the
    /// next place that is free. Made when it is asked for and codes have been added.
    mutable std::vector<Route> _routes;
    mutable std::size_t _routedCodes = 0;
};

} // namespace velmora
