// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "LogGenerator/Display/PathRests.h"
#include "LogGenerator/Observations/Catalogue.h"
#include "LogGenerator/Observations/FieldMap.h"
#include "LogGenerator/OstrelLogGenerator.h"
#include "LogMessages/LogMessage.h"

#include <cstdint>
#include <map>
#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// The template-driven decoder of the binary families. It builds the display from its template once per state
/// and hands every section its node, frames each log message and routes it by log code to its subscribers,
/// has them write what they keep when the display is handed out, and moves the raw messages into the history
/// at each refresh. A technology's subclass only chooses the template and the class index.
///
/// State keys beside LogGenerator's: "Template", the template as it was loaded.
class OstrelLogGenerator2 : public OstrelLogGenerator {
public:
    /// `plistName`: the template's resource name without extension.
    OstrelLogGenerator2(std::string plistName, std::shared_ptr<ClassIndex> index, const Clock& clock);
    /// Leaves all that has arrived in the display, where the next decoder finds it.
    ~OstrelLogGenerator2() override;

    void updateState(Dictionary& state, const Data& data) override;
    /// Reports the subscribers of the message's code.
    void updateStateReporting(Dictionary& state, const Data& data, MessageEffects& effects) override;
    [[nodiscard]] Value generateLogUsingState(Dictionary& state) override;
    [[nodiscard]] Value display(Dictionary& state) override;
    void setWantedPaths(std::span<const std::string> paths) override;
    [[nodiscard]] std::vector<ChangingPlace> changingPlaces(const Dictionary& state) const override;
    /// That of the sections, by name.
    [[nodiscard]] Value memory() const override;
    void setMemory(const Value& memory) override;
    [[nodiscard]] DictionaryRef getStartCommand() const override;
    [[nodiscard]] std::optional<Time> latestRecord(std::string_view section) const override;

    /// Frames one message and routes its record. A message below 13 bytes as it arrived is dropped silently;
    /// a prefix (first byte 0x81, two bytes) is removed; so a prefixed message of 13 bytes has a record of
    /// 11, which each section then finds too short.
    void updateWithData(const Data& message);

    /// A copy of the template in which every section holds its own node; none for a foreign kind of value.
    [[nodiscard]] Value processTemplate(const Value& object);

    /// Logs every value of a display that is no string, array or dictionary.
    void printDict(const Value& object) const;

    /// The state's display with all that has arrived, or none. The call that builds the display returns none,
    /// not the display: callers take that as nothing to show yet. That is intended.
    [[nodiscard]] Value getDisplayFromState(Dictionary& state);

    [[nodiscard]] const ClassIndex& classIndex() const { return *cIndex; }

protected:
    void describe(Catalogue& catalogue) override;
    void observe(Observer* observer) override;

private:
    /// Where a section's node is in the template, and its kind.
    struct Place {
        Catalogue::Node* node;
        bool isList;
    };
    /// The last of two places of the same section.
    using Places = std::map<const Base*, Place>;
    void findSections(const Value& object, Catalogue::Node& node, Places& places) const;
    void describeSections(const Value& object, Places& places, Catalogue& catalogue);
    void describeSection(const Base& section, const Place& place, Catalogue& catalogue);
    /// Does what `updateWithData` does. Returns the code; none for a message that was dropped.
    std::optional<std::uint32_t> route(const Data& message);
    std::optional<std::uint32_t> routeParsed(const Data& message, const LogMessage& parsed);
    /// Sets the nodes of this decoder's sections to those of a display that an earlier decoder built from the
    /// template.
    void attachSections(const Value& display, const Value& shape);

    std::string pListName;
    std::shared_ptr<ClassIndex> cIndex;
    bool _sectionsAttached = false;
    PathRests _wanted{true, {}};                ///< of the root
    std::map<const Base*, FieldMap> _fieldMaps; ///< of the sections that the template has
};

} // namespace velmora
