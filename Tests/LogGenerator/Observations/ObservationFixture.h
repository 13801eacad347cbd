// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/CatalogueWriter.h"
#include "LogGenerator/Observations/Observer.h"

#include <gtest/gtest.h>

#include <cstdint>
#include <span>
#include <string>
#include <string_view>
#include <vector>

namespace velmora {

/// A catalogue, the map of one section and an observer. The section is the node "/Section", and its fields
/// are shown below it under their labels; a list without a label is the section itself.
class ObservationFixture : public testing::Test {
protected:
    static constexpr std::uint32_t code = 0x5137;

    ObservationFixture() { observer.beginMessage(); }

    /// Enters the contents into the catalogue as those of records of that code.
    void describe(std::span<const Content> contents, std::uint32_t logCode = code) {
        CatalogueWriter writer(catalogue, map, [this](std::string_view label) {
            Catalogue::Node& section = catalogue.root().child("Section");
            return std::vector<Catalogue::Node*>{label.empty() ? &section : &section.child(label)};
        });
        writer.setCode(logCode);
        writer.contents(contents);
    }
    /// Describes the contents and lets a record's fields follow.
    void begin(std::span<const Content> contents) {
        describe(contents);
        ASSERT_TRUE(observer.beginSection(map, code));
    }

    [[nodiscard]] std::span<const Observation> observations() const {
        return observer.message(Time(), std::nullopt, std::nullopt).observations;
    }
    /// The only observation.
    [[nodiscard]] const Observation& only() const {
        if (observations().size() != 1)
            throw std::logic_error("not one observation");
        return observations().front();
    }
    [[nodiscard]] const CatalogueField& leaf(std::string_view path) const {
        for (const CatalogueField& each : catalogue.fields())
            if (each.path == path)
                return each;
        throw std::logic_error("no such leaf");
    }
    [[nodiscard]] static std::string pathOf(const Observation& observation) {
        std::string path;
        observation.appendPath(path);
        return path;
    }
    [[nodiscard]] static std::string textOf(const Observation& observation) {
        ObservedText text;
        return std::string(text.of(observation));
    }
    /// Each observation as "path [key] text".
    [[nodiscard]] std::vector<std::string> shown() const {
        std::vector<std::string> lines;
        for (const Observation& each : observations())
            lines.push_back(pathOf(each) + " [" + std::string(each.rowKey) + "] " + textOf(each));
        return lines;
    }

    /// The paths of the leaves that show nothing any more.
    [[nodiscard]] std::vector<std::string> removed() const {
        std::vector<std::string> paths;
        for (const CatalogueField* const each : observer.message(Time(), std::nullopt, std::nullopt).removed)
            paths.push_back(each->path);
        return paths;
    }

    Catalogue catalogue{"Test"};
    FieldMap map{catalogue, "Section"};
    Observer observer;
};

} // namespace velmora
