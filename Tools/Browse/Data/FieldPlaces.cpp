// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Data/FieldPlaces.h"

#include "LogGenerator/OstrelLogGenerator2.h"
#include "LogMessages/LogMessage.h"

namespace velmora {

FieldPlaces::FieldPlaces(const LogGenerator& decoder, const Data& message,
                         const std::set<std::string>& sections)
    : _message(message.bytes()) {
    const auto* const withSections = dynamic_cast<const OstrelLogGenerator2*>(&decoder);
    const std::optional<LogMessage> parsed = LogMessage::parse(_message);
    if (!withSections || !parsed)
        return;
    const std::uint32_t code = parsed->logCode();
    const std::vector<Base*>* const subscribers = withSections->classIndex().getSubscribers(code);
    if (!subscribers)
        return;
    for (const Base* const section : *subscribers)
        for (const View& view : section->views())
            if (view.code == code && (view.table || !view.contents.empty()) &&
                parsed->record.size() >= view.minimumLength &&
                sections.contains(std::string(section->getSectionName())))
                section->decode(view, Record(parsed->record), *this);
}

std::optional<std::size_t> FieldPlaces::find(const Field& field, std::span<const std::uint32_t> rows) const {
    const auto found = _begins.find({&field, {rows.begin(), rows.end()}});
    return found == _begins.end() ? std::nullopt : std::optional(found->second);
}

void FieldPlaces::fields(const Record& record, const Layout& layout) {
    const std::uint8_t* const begin = record.bytes().data();
    // A section may read a copy, such as an entry that it has put together.
    const bool isInside = begin >= _message.data() && begin < _message.data() + _message.size();
    for (const Field& field : layout.fields) {
        beginValue();
        if (isInside)
            _begins.try_emplace({&field, _rows}, static_cast<std::size_t>(begin - _message.data()));
    }
}

void FieldPlaces::beginValue() {
    if (!_levels.empty() && _levels.back().isOfValues)
        _rows.back() = _levels.back().next++;
}

void FieldPlaces::number(const Field&, std::int64_t) {
    beginValue();
}

void FieldPlaces::real(const Field&, double) {
    beginValue();
}

void FieldPlaces::text(const Field&, std::string_view) {
    beginValue();
}

void FieldPlaces::supplied(const Field&, const Value&) {
    beginValue();
}

void FieldPlaces::beginList(const List& list) {
    _levels.push_back({0, list.entries == List::Entries::Values});
    _rows.push_back(0);
}

void FieldPlaces::beginRow() {
    _rows.back() = _levels.back().next++;
}

void FieldPlaces::entryNumber(std::size_t, std::uint16_t number) {
    _rows.back() = number;
}

void FieldPlaces::endList() {
    _levels.pop_back();
    _rows.pop_back();
}

} // namespace velmora
