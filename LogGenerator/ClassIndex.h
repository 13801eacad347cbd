// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Base.h"
#include "LogGenerator/Extra/CellList.h"
#include "LogGenerator/Extra/CellSection.h"

#include <memory>
#include <string>
#include <string_view>
#include <type_traits>
#include <vector>

namespace velmora {

/// A technology's registry: section names to sections, and log codes to their subscribers. It owns the
/// sections. A technology's subclass is the list of them, one field a section; sections that share a log code
/// are called in the order of the fields.
class ClassIndex {
public:
    /// A section of the index, which creates it. A technology needs no more than this field for it:
    ///     Held<GSMServingCell> objGSMServingCell{*this};
    template <class Section>
    class Held {
    public:
        explicit Held(ClassIndex& index) : _section(index.create<Section>()) {}
        Held(const Held&) = delete;
        Held& operator=(const Held&) = delete;

        [[nodiscard]] Section* get() const { return _section; }
        Section* operator->() const { return _section; }

    private:
        Section* _section;
    };

    ClassIndex() = default;
    /// Prints "Deallocing ClassIndex" on the console.
    virtual ~ClassIndex();
    ClassIndex(const ClassIndex&) = delete;
    ClassIndex& operator=(const ClassIndex&) = delete;

    /// The section registered under the name, or null.
    [[nodiscard]] Base* getClass(std::string_view name) const;
    /// The subscribers of the code, in calling order; null when there are none.
    [[nodiscard]] const std::vector<Base*>* getSubscribers(std::uint32_t code) const;
    /// Every subscribed code as a decimal string.
    [[nodiscard]] std::vector<std::string> getAllLogCodes() const;
    /// What the sections read the cell information array with.
    [[nodiscard]] CellList& cellList() const { return *_cellList; }
    /// Has every section write what it keeps into its node.
    void writeNodes() const;
    /// Two log lines on what kind of object `classDict` is.
    void status() const;

    ClassDictionary classDict;
    CodeDictionary codeDictionary;

protected:
    /// Destroys the sections, the first created first.
    void releaseSections();

private:
    /// Makes a section and registers it.
    template <class Section>
    Section* create() {
        auto section = std::make_unique<Section>();
        if constexpr (std::is_base_of_v<CellSection, Section>)
            section->shareCellList(_cellList);
        section->initWithDict(classDict, codeDictionary);
        section->setUnwritten(&_unwritten);
        _routes.clear();
        Section* const made = section.get();
        _sections.push_back(std::move(section));
        return made;
    }

    /// A code of `codeDictionary` and its sections there; null in a free slot.
    struct Route {
        std::uint32_t code = 0;
        const std::vector<Base*>* subscribers = nullptr;
    };
    void makeRoutes() const;

    std::vector<std::unique_ptr<Base>> _sections; ///< in the order of their creation
    mutable std::vector<Base*> _unwritten;        ///< those that keep what is not in their nodes
    std::shared_ptr<CellList> _cellList = std::make_shared<CellList>();
    /// `codeDictionary` as a hash table, which every message needs: the slot of a code is its remainder or
    /// the next free one. Rebuilt lazily when codes have been added.
    mutable std::vector<Route> _routes;
    mutable std::size_t _routedCodes = 0;
};

} // namespace velmora
