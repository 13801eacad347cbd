// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/ClassIndex.h"

#include "Platform/Console.h"
#include "Platform/SystemLog.h"

#include <bit>
#include <charconv>
#include <type_traits>

namespace velmora {

ClassIndex::~ClassIndex() {
    printLine("Deallocing ClassIndex");
}

Base* ClassIndex::getClass(std::string_view name) const {
    const auto found = classDict.find(name);
    return found == classDict.end() ? nullptr : found->second;
}

const std::vector<Base*>* ClassIndex::getSubscribers(std::uint32_t code) const {
    if (_routes.empty() || _routedCodes != codeDictionary.size())
        makeRoutes();
    const std::size_t mask = _routes.size() - 1; // a power of two less one
    std::size_t place = code & mask;
    while (_routes[place].subscribers && _routes[place].code != code)
        place = (place + 1) & mask;
    return _routes[place].subscribers;
}

void ClassIndex::makeRoutes() const {
    // A power of two, at most a quarter full.
    _routes.assign(std::bit_ceil(4 * codeDictionary.size() + 4), Route());
    for (const auto& [text, subscribers] : codeDictionary) {
        std::uint32_t code = 0;
        std::from_chars(text.data(), text.data() + text.size(), code);
        if (std::to_string(code) != text)
            continue; // no code is written so
        std::size_t place = code % _routes.size();
        while (_routes[place].subscribers)
            place = (place + 1) % _routes.size();
        _routes[place] = {code, &subscribers};
    }
    _routedCodes = codeDictionary.size();
}

std::vector<std::string> ClassIndex::getAllLogCodes() const {
    std::vector<std::string> codes;
    codes.reserve(codeDictionary.size());
    for (const auto& [code, subscribers] : codeDictionary)
        codes.push_back(code);
    return codes;
}

void ClassIndex::writeNodes() const {
    // A section that was registered without being created here is in no list.
    if (_sections.size() != classDict.size())
        for (const auto& [name, section] : classDict)
            section->writeNode();
    for (Base* const section : _unwritten)
        section->writeNode();
    for (Base* const section : _unwritten)
        section->leftUnwritten();
    _unwritten.clear();
}

void ClassIndex::releaseSections() {
    for (std::unique_ptr<Base>& section : _sections)
        section.reset();
}

void ClassIndex::status() const {
    using Index = std::remove_const_t<decltype(classDict)>;
    logFormat(LogPriority::Warning, "Dictionary = %d", std::is_same_v<Index, ClassDictionary> ? 1 : 0);
    logFormat(LogPriority::Warning, "String = %d", std::is_same_v<Index, std::string> ? 1 : 0);
}

} // namespace velmora
