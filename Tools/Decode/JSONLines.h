// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tools/Decode/FreshValues.h"
#include "Tools/Decode/Lines/JSONFieldWriter.h"
#include "Tools/Decode/Lines/SectionText.h"
#include "Tools/Text/LineWriter.h"

#include <functional>
#include <map>
#include <string>
#include <unordered_map>
#include <vector>

namespace velmora {

/// One JSON object a line for each refresh: its time, the technology, the number of messages so far, and the
/// selected part of the display. The file's name goes in front where it is not empty.
class RefreshLines final : public LineWriter {
public:
    RefreshLines(Output& output, bool isLive, const DecodeOptions& options, const std::string& file);
    void didMakeDecoder(LogGenerator& decoder) override {
        _ages.watch(decoder);
        _selection.limit(decoder);
    }
    void didRefresh(Time tick, const Decoded& decoded) override;

private:
    const NodeSelection& _selection;
    AgeLimit _ages;
    std::string _begin;
};

/// One JSON object a line for each message: its time, its code (null for a message that was dropped), and
/// what it concerned: "sections", "values" or, without a code, "display". The technology follows the time
/// where the file holds several. With a selection, only what of it is selected, and no line for a message
/// that concerned nothing of that.
class MessageLines final : public LineWriter, private MessageEffects {
public:
    MessageLines(Output& output, bool isLive, const NodeSelection& selection, const std::string& file);
    void didMakeDecoder(LogGenerator& decoder) override;
    void willConcern(const Decoded& decoded) override;
    void willDecode(const LoggedMessage& message) override { _moment = message.time; }
    [[nodiscard]] MessageEffects* effects() override { return this; }
    [[nodiscard]] bool wantsEveryRefresh() const override { return false; }
    void didDecode(const LoggedMessage& message, LogGenerator& decoder, Dictionary& state) override;

private:
    void sections(std::optional<std::uint32_t> code) override;
    void concerned(Base& section) override;
    void section(std::string_view name, const Value& node) override { selectedMember(name, node); }
    void values(std::optional<std::uint32_t> code) override;
    [[nodiscard]] FieldVisitor* valueVisitor() override;
    void value(std::string_view key, const Value& value) override { selectedMember(key, value); }
    void display(const Value& display) override;

    void begin();
    /// Appends the values that were named to `valueVisitor`.
    void endValues();
    void appendCode(std::optional<std::uint32_t> code);
    void member(std::string_view name, const Value& value);
    /// What of a section or value is selected, if anything is.
    void selectedMember(std::string_view name, const Value& value);

    /// Where sections and values are in the displays of a technology, by their names.
    using Places = std::map<std::string, std::vector<const CatalogueNode*>, std::less<>>;

    const NodeSelection& _selection;
    std::map<std::string, Places, std::less<>> _places; ///< by technology; with a selection only
    const Places* _current = nullptr;
    JSONTexts _texts;
    std::unordered_map<const Base*, SectionText> _sections;
    std::unordered_map<std::uint32_t, JSONNode> _values; ///< of each code, as its latest message published
    JSONFieldWriter _writer;
    std::uint32_t _code = 0;    ///< of the values of this message
    JSONNode* _named = nullptr; ///< its values, once they are named
    std::string _begin;
    std::string _technology; ///< the member, from the quote after the time on to that before the next comma
    Time _moment{};
    std::string_view _end; ///< the end of the current line
    bool _first = true;    ///< no member of it so far
};

} // namespace velmora
