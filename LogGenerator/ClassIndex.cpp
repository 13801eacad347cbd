#include "LogGenerator/ClassIndex.h"

#include "Platform/Console.h"
#include "Platform/SystemLog.h"

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
    char key[10];
    const auto end = std::to_chars(key, key + sizeof key, code).ptr;
    const auto found = codeDictionary.find(std::string_view(key, static_cast<std::size_t>(end - key)));
    return found == codeDictionary.end() ? nullptr : &found->second;
}

std::vector<std::string> ClassIndex::getAllLogCodes() const {
    std::vector<std::string> codes;
    codes.reserve(codeDictionary.size());
    for (const auto& [code, subscribers] : codeDictionary)
        codes.push_back(code);
    return codes;
}

void ClassIndex::status() const {
    using Held = std::remove_const_t<decltype(classDict)>;
    logFormat(LogPriority::Warning, "Dictionary = %d", std::is_same_v<Held, ClassDictionary> ? 1 : 0);
    logFormat(LogPriority::Warning, "String = %d", std::is_same_v<Held, std::string> ? 1 : 0);
}

} // namespace velmora
