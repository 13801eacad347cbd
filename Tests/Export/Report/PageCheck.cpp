// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Export/Report/PageCheck.h"

#include <algorithm>
#include <array>
#include <cctype>
#include <cstddef>
#include <vector>

namespace velmora {

namespace {

using namespace std::string_view_literals;

constexpr std::array elements{
    "html"sv,    "head"sv,   "meta"sv,       "title"sv,   "style"sv,   "body"sv,   "a"sv,     "header"sv,
    "h1"sv,      "h2"sv,     "h3"sv,         "nav"sv,     "ul"sv,      "li"sv,     "div"sv,   "main"sv,
    "section"sv, "p"sv,      "b"sv,          "table"sv,   "caption"sv, "thead"sv,  "tbody"sv, "tr"sv,
    "th"sv,      "td"sv,     "span"sv,       "time"sv,    "svg"sv,     "rect"sv,   "path"sv,  "text"sv,
    "figure"sv,  "script"sv, "figcaption"sv, "details"sv, "summary"sv, "footer"sv, "code"sv};
constexpr std::array attributes{
    "lang"sv,       "charset"sv,         "http-equiv"sv, "content"sv, "name"sv,     "class"sv, "href"sv,
    "id"sv,         "aria-labelledby"sv, "aria-label"sv, "scope"sv,   "tabindex"sv, "role"sv,  "datetime"sv,
    "width"sv,      "height"sv,          "viewBox"sv,    "d"sv,       "x"sv,        "y"sv,     "type"sv,
    "aria-hidden"sv};
constexpr std::array voids{"meta"sv};

bool contains(const auto& list, std::string_view name) {
    return std::find(list.begin(), list.end(), name) != list.end();
}

/// The length of a tag from its "<" on; 0 where it is none that a page has. `name` gets its element's.
std::size_t tagLength(std::string_view text, std::string_view& name, bool& isEmpty) {
    std::size_t at = 1;
    const auto takeName = [&] {
        const std::size_t begin = at;
        while (at < text.size() &&
               (std::isalnum(static_cast<unsigned char>(text[at])) != 0 || text[at] == '-'))
            ++at;
        return text.substr(begin, at - begin);
    };
    name = takeName();
    if (!contains(elements, name))
        return 0;
    while (at < text.size() && text[at] == ' ') {
        ++at;
        if (!contains(attributes, takeName()) || text.substr(at, 2) != "=\"")
            return 0;
        const std::size_t end = text.find('"', at + 2);
        if (end == std::string_view::npos ||
            text.substr(at + 2, end - at - 2).find_first_of("<>") != std::string_view::npos)
            return 0;
        at = end + 1;
    }
    isEmpty = text.substr(at, 2) == "/>";
    at += isEmpty ? 1 : 0;
    return at < text.size() && text[at] == '>' ? at + 1 : 0;
}

std::string near(std::string_view text) {
    return std::string(text.substr(0, 120));
}

} // namespace

std::string problemOfPage(std::string_view page) {
    constexpr std::string_view begin = "<!DOCTYPE html>\n";
    if (!page.starts_with(begin))
        return "no document type";
    page.remove_prefix(begin.size());
    std::vector<std::string_view> open;
    int scripts = 0;
    while (!page.empty()) {
        const std::size_t tag = page.find('<');
        const std::string_view text = page.substr(0, tag);
        if (std::any_of(text.begin(), text.end(),
                        [](char each) { return static_cast<unsigned char>(each) < 0x20 && each != '\n'; }))
            return "a control character: " + near(text);
        page.remove_prefix(std::min(tag, page.size()));
        if (page.empty())
            break;
        if (page.starts_with("</")) {
            if (open.empty() || page.substr(2, open.back().size()) != open.back() ||
                page.substr(2 + open.back().size(), 1) != ">")
                return "ends what it did not begin: " + near(page);
            page.remove_prefix(3 + open.back().size());
            open.pop_back();
            continue;
        }
        std::string_view name;
        bool isEmpty = false;
        const std::size_t length = tagLength(page, name, isEmpty);
        if (length == 0)
            return "no tag of a page: " + near(page);
        page.remove_prefix(length);
        if (name == "script" || name == "style") {
            const std::size_t end = page.find("</" + std::string(name) + '>');
            if (end == std::string_view::npos)
                return "a script or style without an end";
            if (name == "script" && ++scripts == 1 && !isJSON(page.substr(0, end)))
                return "the data is no JSON";
            page.remove_prefix(end);
        }
        if (!isEmpty && !contains(voids, name))
            open.push_back(name);
    }
    if (!open.empty())
        return "never ended: " + std::string(open.back());
    return scripts == 2 ? "" : "got " + std::to_string(scripts) + " scripts, wanted 2";
}

} // namespace velmora
