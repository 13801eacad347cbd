// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/Observations/Catalogue.h"
#include "PropertyLists/Value.h"

#include <cstddef>
#include <map>
#include <set>
#include <string>
#include <vector>

namespace velmora {

/// A display's leaves by their paths: those that show a text, and those that are still as `markDisplay` left
/// them. An entry of a numbered list has its number in the path.
struct ShownDisplay {
    /// `hasNumberedLists`: that a dictionary where the catalogue has rows is a list.
    ShownDisplay(const Value& display, Catalogue& catalogue, bool hasNumberedLists);

    struct Leaf {
        std::string pattern; ///< the path in the catalogue
        std::vector<std::string> texts;
    };
    std::map<std::string, Leaf> leaves;
    std::map<std::string, std::vector<std::size_t>> lists; ///< by pattern: how many entries
    std::set<std::string> emptyOnly; ///< those that are empty and never have anything, by the catalogue
    std::map<std::string, std::string> marked; ///< the pattern by the path
    /// Whether a key is named as rows are, or as a path: then a path does not tell which of them it is.
    bool isAmbiguous = false;

private:
    struct Place {
        std::string path;
        std::string pattern;
        const Catalogue::Node* node;
    };
    void read(const Value& value, const Place& place);
    void readDictionary(const Dictionary& dictionary, const Place& place);
    void readNumbered(const Dictionary& entries, const Place& place);
    void readArray(const Array& array, const Place& place);

    bool _hasNumberedLists;
};

/// Replaces all that is shown by a text that no decoder writes, and puts it at the end of each list.
void markDisplay(const Value& display, Catalogue& catalogue);

} // namespace velmora
