// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Analysis/Rules/Files/RuleText.h"

#include "Analysis/Rules/Expression/ExpressionParser.h"

#include <algorithm>
#include <cstddef>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

constexpr std::size_t mostValues = 16;
constexpr std::size_t mostBytes = 512;

/// The brace that ends a value; a brace in a quoted text does not.
std::size_t endOfValue(std::string_view text, std::size_t at) {
    char quote = 0;
    for (; at < text.size(); ++at) {
        const char c = text[at];
        if (quote != 0)
            quote = c == quote ? char{0} : quote;
        else if (c == '\'' || c == '"')
            quote = c;
        else if (c == '}')
            return at;
    }
    return text.npos;
}

void addWords(std::vector<RuleTextPart>& parts, std::string_view words) {
    if (parts.empty() || parts.back().value)
        parts.push_back({});
    parts.back().words += words;
}

} // namespace

std::vector<RuleTextPart> readRuleText(const TOMLNode& node, const InputNames& names, FileErrors& errors) {
    const std::string_view text = node.text;
    std::vector<RuleTextPart> parts;
    if (text.size() > mostBytes || text.find('\n') != text.npos) {
        errors.add(node.position,
                   "got a text of several lines or of more than " + std::to_string(mostBytes) + " bytes");
        return parts;
    }
    std::size_t values = 0;
    for (std::size_t at = 0; at < text.size();) {
        if (text.substr(at).starts_with("{{") || text.substr(at).starts_with("}}")) {
            addWords(parts, text.substr(at, 1));
            at += 2;
        } else if (text[at] == '{') {
            const std::size_t end = endOfValue(text, at);
            if (end == text.npos || ++values > mostValues) {
                errors.addInText(node, at,
                                 end == text.npos
                                     ? "got a { without a }, wanted {{ for the character itself"
                                     : "got more than " + std::to_string(mostValues) + " values");
                return parts;
            }
            const std::string_view value = text.substr(at + 1, end - at - 1);
            auto parsed = parseExpression(value, names);
            if (const auto* const mistake = std::get_if<ExpressionError>(&parsed))
                errors.addInText(node, at + 1 + mistake->position, mistake->text);
            else if (!std::get<Expression>(parsed).windows.empty())
                errors.addInText(node, at + 1, "got a window of time, which a text cannot have");
            else
                parts.push_back({std::string(value), std::get<Expression>(std::move(parsed))});
            at = end + 1;
        } else if (text[at] == '}') {
            errors.addInText(node, at, "got a } without a {, wanted }} for the character itself");
            return parts;
        } else {
            const std::size_t end = std::min(text.find_first_of("{}", at), text.size());
            addWords(parts, text.substr(at, end - at));
            at = end;
        }
    }
    return parts;
}

} // namespace velmora
