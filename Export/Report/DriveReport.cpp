// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/DriveReport.h"

#include "Export/Report/Page/PageWriter.h"
#include "Recording/MessageReader.h"

#include <algorithm>
#include <utility>

namespace velmora {

namespace {

/// Of the rules whose texts show values of the display, which may be identities, the texts without them.
std::map<std::string, std::string, std::less<>> plainTexts(const RuleSet* rules) {
    std::map<std::string, std::string, std::less<>> texts;
    if (!rules)
        return texts;
    for (const RuleSet::Summary& rule : rules->summaries()) {
        const std::size_t placeholder = rule.text.find('{');
        if (placeholder != std::string_view::npos &&
            rule.text.find('/', placeholder) != std::string_view::npos)
            texts.emplace(rule.name, rule.text);
    }
    return texts;
}

} // namespace

DriveReport::DriveReport(Options options)
    : _options(std::move(options)), _inputs(_options.files.size()),
      _events(_options.hasIdentities, plainTexts(_options.rules)),
      _groups({_options.files.size() == 2 ? StatisticsPlan::By::File : StatisticsPlan::By::Nothing, {}},
              [](const GroupStatistics&) {}) {
    for (std::size_t i = 0; i < _inputs.size(); ++i)
        _inputs[i].name = _options.files[i];
}

TechnologyReport& DriveReport::of(const Catalogue& catalogue) {
    for (const auto& each : _technologies)
        if (&each->catalogue() == &catalogue)
            return *each;
    TechnologyReport& report = *_technologies.emplace_back(std::make_unique<TechnologyReport>(
        catalogue, _options.rules ? &_options.rules->classes() : nullptr, _groups, _events));
    if (_options.rules)
        report.add(makeRuleDetector(*_options.rules, catalogue));
    return report;
}

void DriveReport::count(MessageNumber message, Time time) {
    ReportInput& input = _inputs[message.input];
    ++input.messages;
    input.lastNumber = std::max(input.lastNumber, message.number);
    _spans.add(time);
    input.first = input.first ? std::min(*input.first, time) : time;
    input.last = input.last ? std::max(*input.last, time) : time;
}

void DriveReport::endInput(std::uint32_t input, const MessageReader& reader) {
    ReportInput& known = _inputs[input];
    known.losses = reader.lossTotals().losses;
    known.lostBytes = reader.lossTotals().bytes;
    for (const Loss& loss : reader.losses()) {
        known.firstLosses.push_back({loss.recordNumber, loss.offset, loss.reason});
        known.lastNumber = std::max(known.lastNumber, loss.recordNumber);
    }
    if (reader.failure())
        known.failure = reader.failure()->reason;
    known.noteCount = reader.comments().count();
    for (const Comment& comment : reader.comments().first()) {
        const bool isOfMessage = comment.about == Comment::About::Message;
        known.notes.push_back({isOfMessage ? comment.number : 0, comment.text});
    }
}

void DriveReport::fail(std::uint32_t input, std::string reason) {
    _inputs[input].failure = std::move(reason);
}

void DriveReport::finish() {
    for (const auto& each : _technologies)
        each->finish();
    _events.finish();
}

std::uint64_t DriveReport::numbersBefore(std::uint32_t input) const {
    std::uint64_t numbers = 0;
    for (std::uint32_t i = 0; i < input; ++i)
        numbers += _inputs[i].lastNumber;
    return numbers;
}

void DriveReport::write(const std::function<void(std::string_view)>& put) const {
    PageWriter(*this, put).write();
}

} // namespace velmora
