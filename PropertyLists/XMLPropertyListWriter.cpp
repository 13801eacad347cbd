// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "PropertyLists/PropertyListDate.h"
#include "PropertyLists/XMLScalars.h"
#include "PropertyLists/XMLText.h"

#include <string_view>

namespace velmora {

namespace {

constexpr std::string_view head = "<?xml version=\"1.0\" encoding=\"UTF-8\"?>\n"
                                  "<plist version=\"1.0\">\n";
constexpr std::string_view foot = "</plist>\n";
constexpr std::size_t maximumDepth = PropertyListLimits{}.maximumDepth;

/// A function that fails returns false and has set the reason.
class Writer {
public:
    Result<std::string> write(const Value& root) {
        _output = head;
        if (!writeValue(root, 0))
            return Failure{_reason};
        _output += foot;
        return std::move(_output);
    }

private:
    bool fail(std::string reason) {
        _reason = std::move(reason);
        return false;
    }

    void indent(std::size_t depth) { _output.append(depth, '\t'); }

    bool appendEscaped(std::string_view text) {
        if (const auto offset = firstNotXML(text))
            return fail("a string holds what XML cannot carry at its offset " + std::to_string(*offset));
        while (!text.empty()) {
            const std::size_t plain = text.find_first_of("&<>\r");
            _output += text.substr(0, plain);
            if (plain == std::string_view::npos)
                break;
            switch (text[plain]) {
            case '&': _output += "&amp;"; break;
            case '<': _output += "&lt;"; break;
            case '>': _output += "&gt;"; break;
            // A reader turns a bare carriage return into a line feed.
            default: _output += "&#13;"; break;
            }
            text.remove_prefix(plain + 1);
        }
        return true;
    }

    bool writeText(std::string_view element, std::string_view text, std::size_t depth) {
        indent(depth);
        _output += '<';
        _output += element;
        _output += '>';
        if (!appendEscaped(text))
            return false;
        _output += "</";
        _output += element;
        _output += ">\n";
        return true;
    }

    bool writeLine(std::string_view line, std::size_t depth) {
        indent(depth);
        _output += line;
        _output += '\n';
        return true;
    }

    bool writeData(Bytes bytes, std::size_t depth) {
        writeLine("<data>", depth);
        appendXMLOfData(_output, bytes, std::string(depth, '\t'));
        return writeLine("</data>", depth);
    }

    bool writeArray(const Array& array, std::size_t depth) {
        if (depth >= maximumDepth)
            return fail("the value is nested deeper than " + std::to_string(maximumDepth));
        if (array.empty())
            return writeLine("<array/>", depth);
        writeLine("<array>", depth);
        for (const Value& element : array)
            if (!writeValue(element, depth + 1))
                return false;
        return writeLine("</array>", depth);
    }

    bool writeDictionary(const Dictionary& dictionary, std::size_t depth) {
        if (depth >= maximumDepth)
            return fail("the value is nested deeper than " + std::to_string(maximumDepth));
        if (dictionary.empty())
            return writeLine("<dict/>", depth);
        writeLine("<dict>", depth);
        for (const auto& [key, element] : dictionary)
            if (!writeText("key", key, depth + 1) || !writeValue(element, depth + 1))
                return false;
        return writeLine("</dict>", depth);
    }

    bool writeValue(const Value& value, std::size_t depth) {
        switch (value.kind()) {
        case Value::Kind::String: return writeText("string", *value.asString(), depth);
        case Value::Kind::Integer: return writeText("integer", std::to_string(*value.asInteger()), depth);
        case Value::Kind::Real: return writeText("real", xmlOfReal(*value.asReal()), depth);
        case Value::Kind::Boolean: return writeLine(*value.asBoolean() ? "<true/>" : "<false/>", depth);
        case Value::Kind::Date:
            if (!isPropertyListDate(*value.asDate()))
                return fail("a date lies outside the years 0001 to 9999");
            return writeText("date", xmlOfDate(*value.asDate()), depth);
        case Value::Kind::Data: return writeData(value.asData()->bytes(), depth);
        case Value::Kind::Array: return writeArray(*value.asArray(), depth);
        case Value::Kind::Dictionary: return writeDictionary(*value.asDictionary(), depth);
        case Value::Kind::None: break;
        }
        return fail("there is no value to write");
    }

    std::string _output;
    std::string _reason;
};

} // namespace

Result<std::string> writeXMLPropertyList(const Value& root) {
    return Writer().write(root);
}

} // namespace velmora
