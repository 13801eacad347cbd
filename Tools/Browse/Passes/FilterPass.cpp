// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/Passes/FilterPass.h"

#include "LogMessages/LogMessage.h"
#include "Tools/Messages/LogCodeText.h"

#include <algorithm>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

/// The codes of a list such as "0x5134, 0x5137"; empty for any other text.
std::vector<std::uint32_t> codesOf(std::string_view text) {
    std::vector<std::uint32_t> codes;
    while (!text.empty()) {
        const std::size_t end = std::min(text.find_first_of(", "), text.size());
        if (end > 0) {
            const Result<std::uint32_t> code = readLogCode(text.substr(0, end));
            if (!code)
                return {};
            codes.push_back(*code);
        }
        text.remove_prefix(std::min(end + 1, text.size()));
    }
    return codes;
}

} // namespace

Result<std::unique_ptr<FilterPass>> FilterPass::make(const BrowsedFile& file, const std::string& text) {
    std::vector<std::uint32_t> codes = codesOf(text);
    const bool hasCodes = !codes.empty();
    std::unique_ptr<FilterPass> pass(new FilterPass(file, text, std::move(codes)));
    if (hasCodes)
        return pass;
    Result<std::unique_ptr<FilterExpression>> expression = FilterExpression::make(text, pass->catalogue());
    if (!expression)
        return Failure{expression.reason()};
    pass->_expression = *std::move(expression);
    pass->beginObserving();
    return pass;
}

FilterPass::FilterPass(const BrowsedFile& file, std::string text, std::vector<std::uint32_t> codes)
    : FilePass(file, codes.empty() ? Decoding::With : Decoding::Without), _filter(std::move(text)),
      _codes(std::move(codes)) {}

void FilterPass::observed(const ObservedMessage& message) {
    _expression->report({{0, position() + 1}, message.arrival, message});
}

void FilterPass::took(const LoggedMessage& message) {
    bool passes = false;
    if (_expression) {
        passes = _expression->holds();
    } else if (const std::optional<LogMessage> parsed = LogMessage::parse(message.message.bytes())) {
        passes = std::find(_codes.begin(), _codes.end(), parsed->logCode()) != _codes.end();
    }
    if (passes)
        _matches.push_back(static_cast<std::uint32_t>(position()));
}

} // namespace velmora
