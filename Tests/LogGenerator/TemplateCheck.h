// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/ClassIndex.h"
#include "PropertyLists/Value.h"

#include <functional>
#include <set>
#include <string>
#include <string_view>
#include <vector>

/// What the tests of the shipped display templates share: a template as a list of its keys, and what is
/// expected of it.

namespace velmora {

/// A key of a template with its value.
struct TemplateNode {
    std::string key;
    Value value;
};

/// Every key of that file of the resources, as in "LTE.plist", at whatever depth; std::runtime_error where it
/// is no property list.
[[nodiscard]] std::vector<TemplateNode> shippedTemplate(std::string_view fileName);

/// Expects each section of the index once: an empty array for those of `lists`, an empty dictionary for all
/// others, so that nothing is shown that the phone has not reported.
void expectEverySectionOnce(const std::vector<TemplateNode>& nodes, const ClassIndex& index,
                            const std::set<std::string, std::less<>>& lists);

/// Expects nothing besides the sections but these groups, in this order. A group holds something: a section
/// under a misspelt name would hold nothing.
void expectGroups(const std::vector<TemplateNode>& nodes, const ClassIndex& index,
                  const std::vector<std::string>& groups);

/// Expects every key to be a path component.
void expectPathComponents(const std::vector<TemplateNode>& nodes);

} // namespace velmora
