// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "PropertyLists/PropertyList.h"
#include "PropertyLists/ReadingBudget.h"
#include "PropertyLists/XMLDocument.h"
#include "PropertyLists/XMLScalars.h"
#include "PropertyLists/XMLText.h"

#include <pugixml.hpp>

#include <algorithm>
#include <iterator>
#include <optional>
#include <string>
#include <string_view>
#include <utility>

namespace velmora {

namespace {

constexpr std::string_view elementNames[] = {"plist", "dict", "array", "key",  "string", "integer",
                                             "real",  "date", "data",  "true", "false"};

bool isSpace(std::string_view text) {
    return std::all_of(text.begin(), text.end(), isXMLSpace);
}

/// Turns the parsed document into a value. A function that fails returns false and has set the reason.
class Reader {
public:
    Reader(const XMLDocument& document, const PropertyListLimits& limits)
        : _document(document), _limits(limits), _budget(limits) {}

    Result<Value> read() {
        Value root;
        if (!readDocument(root))
            return Failure{_reason};
        return root;
    }

private:
    bool fail(std::string reason) {
        _reason = std::move(reason);
        return false;
    }
    bool failAt(std::size_t offset, const std::string& reason) {
        return fail(XMLDocument::failureAt(offset, reason).reason);
    }
    bool failAt(pugi::xml_node node, const std::string& reason) {
        return failAt(_document.offsetOf(node), reason);
    }
    [[nodiscard]] std::string quoted(std::string_view text) const;
    [[nodiscard]] std::string tag(std::string_view name) const;
    bool isAllowed(std::optional<Failure> excess) { return !excess || fail(std::move(excess->reason)); }

    bool readDocument(Value& value);
    bool readPlist(pugi::xml_node plist, Value& value);
    bool readValue(pugi::xml_node element, std::size_t depth, Value& value);
    bool readArray(pugi::xml_node element, std::size_t depth, Value& value);
    bool readDictionary(pugi::xml_node element, std::size_t depth, Value& value);
    bool readScalar(pugi::xml_node element, std::string_view name, Value& value);
    bool readText(pugi::xml_node element, std::string& text);
    bool appendUnescaped(std::string_view piece, std::size_t offset, std::string& text);
    bool expectNoText(pugi::xml_node element);
    bool nextElement(pugi::xml_node parent, pugi::xml_node& element);

    const XMLDocument& _document;
    const PropertyListLimits& _limits;
    ReadingBudget _budget;
    std::string _reason;
};

/// Text as reasons show it.
std::string Reader::quoted(std::string_view text) const {
    if (!_limits.quotesInput)
        return "of " + std::to_string(text.size()) + (text.size() == 1 ? " byte" : " bytes");
    constexpr std::size_t longest = 40;
    if (text.size() <= longest)
        return "\"" + std::string(text) + "\"";
    std::size_t end = longest;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
        --end;
    return "\"" + std::string(text.substr(0, end)) + "...\"";
}

/// A name as reasons show it.
std::string Reader::tag(std::string_view name) const {
    const bool isShown =
        _limits.quotesInput || std::ranges::find(elementNames, name) != std::end(elementNames);
    return "<" + (isShown ? std::string(name) : "...") + ">";
}

/// The next element after `element`, or the first one where that is null; null at the end. Only white space
/// may be between elements.
bool Reader::nextElement(pugi::xml_node parent, pugi::xml_node& element) {
    element = element ? element.next_sibling() : parent.first_child();
    while (element && element.type() != pugi::node_element) {
        const std::string_view text = element.value();
        if (!isSpace(text))
            return failAt(element, "text " + quoted(text) + " where an element was wanted");
        element = element.next_sibling();
    }
    return true;
}

/// The text before an element's first child is kept in the element itself.
bool Reader::expectNoText(pugi::xml_node element) {
    const std::string_view text = element.value();
    if (isSpace(text))
        return true;
    return failAt(_document.offsetOf(text), "text " + quoted(text) + " where an element was wanted");
}

bool Reader::readDocument(Value& value) {
    pugi::xml_node root;
    if (!nextElement(_document.root(), root))
        return false;
    if (!root)
        return fail("the list has no element");
    const bool good =
        std::string_view(root.name()) == "plist" ? readPlist(root, value) : readValue(root, 1, value);
    if (!good || !nextElement(_document.root(), root))
        return false;
    return !root || failAt(root, "a second root element " + tag(root.name()));
}

bool Reader::readPlist(pugi::xml_node plist, Value& value) {
    pugi::xml_node element;
    if (!expectNoText(plist) || !nextElement(plist, element))
        return false;
    if (!element)
        return failAt(plist, "<plist> holds no value");
    if (!readValue(element, 1, value) || !nextElement(plist, element))
        return false;
    return !element || failAt(element, "a second value in <plist>");
}

bool Reader::readValue(pugi::xml_node element, std::size_t depth, Value& value) {
    if (!isAllowed(_budget.takeObject()))
        return false;
    const std::string_view name = element.name();
    const bool isArray = name == "array";
    if (!isArray && name != "dict")
        return readScalar(element, name, value);
    if (depth > _limits.maximumDepth)
        return failAt(element, "<" + std::string(name) + "> is nested deeper than " +
                                   std::to_string(_limits.maximumDepth));
    if (!expectNoText(element))
        return false;
    return isArray ? readArray(element, depth, value) : readDictionary(element, depth, value);
}

bool Reader::readArray(pugi::xml_node element, std::size_t depth, Value& value) {
    auto array = makeArray();
    pugi::xml_node child;
    while (nextElement(element, child)) {
        if (!child) {
            value = std::move(array);
            return true;
        }
        Value entry;
        if (!readValue(child, depth + 1, entry))
            return false;
        array->append(std::move(entry));
    }
    return false;
}

bool Reader::readDictionary(pugi::xml_node element, std::size_t depth, Value& value) {
    auto dictionary = makeDictionary();
    std::string key;
    pugi::xml_node child;
    while (nextElement(element, child)) {
        if (!child) {
            value = std::move(dictionary);
            return true;
        }
        if (std::string_view(child.name()) != "key")
            return failAt(child, tag(child.name()) + " where a <key> was wanted");
        const pugi::xml_node keyElement = child;
        if (!isAllowed(_budget.takeObject()) || !readText(keyElement, key) ||
            !isAllowed(_budget.takeBytes(2 * key.size())) || !nextElement(element, child))
            return false;
        if (!child)
            return failAt(keyElement, "the key " + quoted(key) + " has no value");
        Value entry;
        if (!readValue(child, depth + 1, entry))
            return false;
        dictionary->set(key, std::move(entry));
    }
    return false;
}

bool Reader::readScalar(pugi::xml_node element, std::string_view name, Value& value) {
    const bool isString = name == "string";
    const bool isTrue = name == "true";
    const bool isInteger = name == "integer";
    const bool isReal = name == "real";
    const bool isDate = name == "date";
    if (!isString && !isTrue && !isInteger && !isReal && !isDate && name != "false" && name != "data")
        return failAt(element, tag(name) + " where a value was wanted");

    std::string text;
    if (!readText(element, text))
        return false;
    const auto wanted = [&](std::string_view what) {
        return failAt(element, tag(name) + " holds " + (_limits.quotesInput ? "" : "text ") + quoted(text) +
                                   ", not " + std::string(what));
    };
    if (isString) {
        if (!isAllowed(_budget.takeBytes(text.size())))
            return false;
        value = Value(std::move(text));
        return true;
    }
    if (isInteger) {
        const XMLInteger integer = integerOfXML(text);
        if (integer.status == XMLInteger::Status::OutOfRange)
            return wanted("a number of 64 bits");
        if (integer.status == XMLInteger::Status::NotANumber)
            return wanted("an integer");
        value = integer.value;
        return true;
    }
    if (isReal) {
        const auto real = realOfXML(text);
        value = real ? Value(*real) : Value();
        return real || wanted("a real");
    }
    if (isDate) {
        const auto date = dateOfXML(text);
        value = date ? Value(*date) : Value();
        return date || wanted("a date like 2026-11-16T05:00:00Z");
    }
    if (name == "data") {
        const auto data = dataOfXML(text);
        if (data && !isAllowed(_budget.takeBytes(data->size())))
            return false;
        value = data ? Value(*data) : Value();
        return data || wanted("base64");
    }
    value = isTrue;
    return isSpace(text) || wanted("nothing");
}

bool Reader::readText(pugi::xml_node element, std::string& text) {
    text.clear();
    const std::string_view first = element.value();
    if (!first.empty() && !appendUnescaped(first, _document.offsetOf(first), text))
        return false;
    for (const pugi::xml_node piece : element.children()) {
        if (piece.type() == pugi::node_element)
            return failAt(piece, tag(piece.name()) + " inside " + tag(element.name()));
        if (piece.type() == pugi::node_cdata)
            text += piece.value();
        else if (!appendUnescaped(piece.value(), _document.offsetOf(piece), text))
            return false;
    }
    return true;
}

bool Reader::appendUnescaped(std::string_view piece, std::size_t offset, std::string& text) {
    if (piece.find('&') == std::string_view::npos) {
        text += piece;
        return true;
    }
    const XMLUnescaped unescaped = unescapedXML(piece);
    if (!unescaped.text)
        return failAt(offset,
                      "the text here has the unknown reference " + quoted(unescaped.unknownReference));
    text += *unescaped.text;
    return true;
}

} // namespace

Result<Value> readXMLPropertyList(Bytes input, const PropertyListLimits& limits) {
    XMLDocument document;
    if (const Result<Done> parsed = document.parse(input, limits); !parsed)
        return Failure{parsed.reason()};
    return Reader(document, limits).read();
}

} // namespace velmora
