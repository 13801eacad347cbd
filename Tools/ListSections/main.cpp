// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Platform/Console.h"
#include "Platform/Linux/Files/FileResources.h"
#include "Platform/PrintableText.h"
#include "Platform/UTF8.h"
#include "Tools/ListSections/DissectorTables.h"
#include "Tools/ListSections/ModemTables.h"
#include "Tools/ListSections/TechnologyTable.h"

#include <cstdio>
#include <exception>
#include <fstream>
#include <functional>
#include <iomanip>
#include <iostream>
#include <map>
#include <sstream>
#include <stdexcept>
#include <string>
#include <string_view>

/// The program list-sections, which the build runs: it prints what the source tree needs to know of the
/// sections outside their decoders.

namespace velmora {
namespace {

using Tables = std::vector<TechnologyTable>;

std::string codeText(std::uint32_t code) {
    char text[16];
    std::snprintf(text, sizeof text, "0x%04X", static_cast<unsigned>(code));
    return text;
}

/// The source of the library velmora_log_codes (see LogMessages/LogCodes.h).
std::string logCodesSource(const Tables& tables) {
    std::ostringstream text;
    std::map<std::uint32_t, unsigned> technologies; // a bit each, by log code
    text << "// Generated from the decoders' sections by list-sections.\n\n"
            "#include \"LogMessages/LogCodes.h\"\n\n"
            "namespace velmora {\n\n"
            "std::string_view technologyOfBit(unsigned bit) {\n"
            "    constexpr std::string_view names[technologyBits] = {\n";
    for (unsigned bit = 1; const TechnologyTable& table : tables) {
        text << "        " << std::quoted(table.name) << ",\n";
        for (const auto& [code, names] : table.sections)
            technologies[code] |= bit;
        for (const auto& [code, name] : table.records)
            technologies[code] |= bit;
        bit <<= 1;
    }
    text << "    };\n"
            "    return names[bit];\n"
            "}\n\n"
            "std::span<const LogCodeRow> logCodeRows() {\n"
            "    static constexpr LogCodeRow rows[] = {\n";
    for (const auto& [code, bits] : technologies)
        text << "        {" << codeText(code) << ", " << bits << "},\n";
    text << "    };\n"
            "    return rows;\n"
            "}\n\n"
            "} // namespace velmora\n";
    return text.str();
}

/// The fields of the Lua table that gives the sections by technology and log code.
std::string dissectorSections(const Tables& tables) {
    std::ostringstream text;
    text << "    order = {";
    for (const char* separator = ""; const TechnologyTable& table : tables) {
        text << separator << std::quoted(table.name);
        separator = ", ";
    }
    text << "},\n";
    for (const TechnologyTable& table : tables) {
        text << "    " << table.name << " = {\n";
        for (const auto& [code, names] : table.sections) {
            text << "        [" << codeText(code) << "] = {";
            for (const char* separator = ""; const std::string& name : names) {
                text << separator << std::quoted(name);
                separator = ", ";
            }
            text << "},\n";
        }
        text << "    },\n";
    }
    return text.str();
}

/// The fields of the Lua table that gives the names of records by log code.
std::string dissectorRecords(const Tables& tables) {
    std::ostringstream text;
    for (const TechnologyTable& table : tables)
        for (const auto& [code, name] : table.records)
            text << "    [" << codeText(code) << "] = " << std::quoted(name) << ",\n";
    return text.str();
}

/// The first and the last of each run of such characters, in ascending order.
std::string rangesOf(const std::function<bool(CharacterKind)>& isWanted) {
    constexpr char32_t first = 0x20; // the rest needs no table
    constexpr char32_t last = 0x10FFFF;
    std::ostringstream text;
    text << std::hex;
    const auto isOfKind = [&isWanted](char32_t character) {
        return isUnicodeScalar(character) && isWanted(kindOf(character));
    };
    int ranges = 0;
    for (char32_t character = first; character <= last; ++character) {
        if (!isOfKind(character))
            continue;
        text << (ranges++ % 6 == 0 ? "\n        " : " ") << "0x" << static_cast<unsigned>(character);
        while (character < last && isOfKind(character + 1))
            ++character;
        text << ", 0x" << static_cast<unsigned>(character) << ',';
    }
    return text.str();
}

/// The fields of the Lua table that gives the characters that are not shown as they are.
std::string dissectorCharacters() {
    const auto isEscaped = [](CharacterKind kind) {
        return kind == CharacterKind::Control || kind == CharacterKind::Hidden;
    };
    const auto isMark = [](CharacterKind kind) { return kind == CharacterKind::Mark; };
    return "    escaped = {" + rangesOf(isEscaped) + "\n    },\n    marks = {" + rangesOf(isMark) +
           "\n    },\n";
}

/// A line "@PART name@" stands for the file of that name beside the template.
constexpr std::string_view partMarker = "@PART ";

/// Copies the dissector's template, with its parts and the tables in place of the lines that name them.
class DissectorWriter {
public:
    DissectorWriter(const Tables& tables, std::ostream& dissector)
        : _templates({VELMORA_RESOURCE_DIRECTORY}), _dissected(_templates), _dissector(dissector) {
        _tables["@SECTIONS@"] = dissectorSections(tables);
        _tables["@RECORDS@"] = dissectorRecords(tables);
        _tables["@CHARACTERS@"] = dissectorCharacters();
        _tables["@VIEWS@"] = _dissected.views();
        _tables["@PATHS@"] = _dissected.paths();
        _tables["@MODEM@"] = modemTables();
        std::ostringstream fields;
        _dissected.fields().writeFields(fields);
        _tables["@FIELDS@"] = fields.str();
        std::ostringstream texts;
        _dissected.fields().writeTexts(texts);
        _tables["@TEXTS@"] = texts.str();
    }

    void write(std::istream& source) {
        for (std::string line; std::getline(source, line);) {
            if (const auto table = _tables.find(line); table != _tables.end()) {
                ++_uses[line];
                _dissector << table->second;
            } else if (line.starts_with(partMarker) && line.ends_with('@')) {
                writePart(line.substr(partMarker.size(), line.size() - partMarker.size() - 1));
            } else {
                _dissector << line << '\n';
            }
        }
    }
    /// Whether the tables that every dissector has were named once.
    [[nodiscard]] bool isComplete() { return _uses["@SECTIONS@"] == 1 && _uses["@RECORDS@"] == 1; }

private:
    void writePart(const std::string& name) {
        std::ifstream part(VELMORA_RESOURCE_DIRECTORY "/wireshark/" + name);
        if (!part)
            throw std::runtime_error("no part " + name);
        write(part);
    }

    FileResources _templates;
    DissectorTables _dissected;
    std::ostream& _dissector;
    std::map<std::string, std::string> _tables; ///< by their lines
    std::map<std::string, int> _uses;
};

/// Whether the template named the tables.
bool writeDissector(const Tables& tables, std::istream& source, std::ostream& dissector) {
    DissectorWriter writer(tables, dissector);
    writer.write(source);
    return writer.isComplete();
}

int run(std::string_view what) {
    const Tables tables = technologyTables();
    if (what == "log-codes") {
        std::cout << logCodesSource(tables);
    } else if (!writeDissector(tables, std::cin, std::cout)) {
        std::cerr << "list-sections: the template has to have one line @SECTIONS@ and one @RECORDS@\n";
        return 1;
    }
    if (!std::cout.flush()) {
        std::cerr << "list-sections: standard output cannot be written\n";
        return 1;
    }
    return 0;
}

} // namespace
} // namespace velmora

int main(int argc, char* argv[]) {
    const std::string_view what = argc == 2 ? argv[1] : "";
    if (what != "log-codes" && what != "dissector") {
        std::cerr << "usage: list-sections log-codes\n"
                     "       list-sections dissector <TEMPLATE\n";
        return 2;
    }
    // Class indexes print lines when they are destroyed; standard output is for the tables.
    if (std::FILE* const nowhere = std::fopen("/dev/null", "w"))
        velmora::redirectConsole(nowhere);
    try {
        return velmora::run(what);
    } catch (const std::exception& failure) {
        std::cerr << "list-sections: " << failure.what() << '\n';
        return 1;
    }
}
