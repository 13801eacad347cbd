// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Text/JSONText.h"

#include "Platform/Base64.h"
#include "Platform/DateText.h"
#include "Platform/PrintableText.h"
#include "Platform/UTF8.h"

#include <array>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <cstdio>
#include <cstring>
#include <optional>
#include <string>

namespace velmora {

namespace {

constexpr std::string_view replacementCharacter = "\xEF\xBF\xBD"; // U+FFFD
constexpr char hexDigits[] = "0123456789abcdef";

constexpr bool isPlain(unsigned char byte) {
    return byte >= 0x20 && byte < 0x80 && byte != '"' && byte != '\\';
}

constexpr std::array<bool, 256> plainBytes = []() {
    std::array<bool, 256> plain{};
    for (std::size_t byte = 0; byte < plain.size(); ++byte)
        plain[byte] = isPlain(static_cast<unsigned char>(byte));
    return plain;
}();

/// Eight bytes at a time: nearly all text is plain, in segments of some ten bytes.
using Word = std::uint64_t;

/// Whether a byte of the word is not plain. The tests for zero and for less may also flag a byte above one
/// that they flag rightly, which does not change the result.
bool hasUnusual(Word word) {
    constexpr Word ones = 0x0101010101010101;
    constexpr Word tops = 0x8080808080808080;
    const auto holds = [word](Word byte) {
        const Word zeroed = word ^ (ones * byte);
        return (zeroed - ones) & ~zeroed;
    };
    return (((word - ones * 0x20) | word | holds('"') | holds('\\')) & tops) != 0;
}

/// Copies the word; false, the copy being of no use, where it holds anything unusual.
bool copyPlainWord(char* to, const char* from) {
    Word word = 0;
    std::memcpy(&word, from, sizeof word);
    std::memcpy(to, &word, sizeof word);
    return !hasUnusual(word);
}

/// Copies the text, at most up to the first byte that is not plain. Returns the number of bytes; those after
/// them, up to the text's length, may have been written to as well. It may stop short of that byte, but not
/// where the entire text is plain.
std::size_t copyPlain(char* to, std::string_view text) {
    std::size_t done = 0;
    for (; text.size() - done >= sizeof(Word); done += sizeof(Word))
        if (!copyPlainWord(to + done, text.data() + done))
            return done;
    if (done == text.size())
        return done;
    if (text.size() >= sizeof(Word)) {
        // The last eight bytes, some of which have been copied before.
        const std::size_t last = text.size() - sizeof(Word);
        return copyPlainWord(to + last, text.data() + last) ? text.size() : done;
    }
    for (; done < text.size() && plainBytes[static_cast<unsigned char>(text[done])]; ++done)
        to[done] = text[done];
    return done;
}

void appendEscape(TextBuffer& out, char character) {
    switch (character) {
    case '"': out.append("\\\""); return;
    case '\\': out.append("\\\\"); return;
    case '\b': out.append("\\b"); return;
    case '\f': out.append("\\f"); return;
    case '\n': out.append("\\n"); return;
    case '\r': out.append("\\r"); return;
    case '\t': out.append("\\t"); return;
    default: break;
    }
    const auto byte = static_cast<unsigned char>(character);
    const char escape[] = {'\\', 'u', '0', '0', hexDigits[byte >> 4], hexDigits[byte & 0xF]};
    out.append(std::string_view(escape, sizeof escape));
}

/// As JSON has it: one or two units of UTF-16.
void appendEscapedCharacter(TextBuffer& out, char32_t character) {
    char text[16];
    if (character < 0x10000)
        std::snprintf(text, sizeof text, "\\u%04x", static_cast<unsigned>(character));
    else
        std::snprintf(text, sizeof text, "\\u%04x\\u%04x",
                      static_cast<unsigned>(0xD800 + ((character - 0x10000) >> 10)),
                      static_cast<unsigned>(0xDC00 + (character & 0x3FF)));
    out.append(std::string_view(text));
}

void appendUnusual(TextBuffer& out, std::string_view text) {
    for (std::size_t offset = 0; offset < text.size();) {
        const auto byte = static_cast<unsigned char>(text[offset]);
        const std::size_t begin = offset;
        if (plainBytes[byte]) {
            out.append(text[offset++]);
        } else if (byte < 0x80) {
            appendEscape(out, text[offset++]);
        } else if (const auto character = nextCharacter(text, offset)) {
            // The same to a reader; as it is it would control a terminal, or hide there.
            if (kindOf(*character) == CharacterKind::Control)
                appendEscapedCharacter(out, *character);
            else
                out.append(text.substr(begin, offset - begin));
        } else {
            ++offset;
            out.append(replacementCharacter);
        }
    }
}

template <class Number>
void appendNumber(TextBuffer& out, Number number) {
    constexpr std::size_t longest = 32;
    char* const at = out.room(longest);
    out.advance(static_cast<std::size_t>(std::to_chars(at, at + longest, number).ptr - at));
}

/// The shortest text that reads back as the same number, and never as an integer.
void appendReal(TextBuffer& out, double real) {
    if (!std::isfinite(real)) {
        out.append("null");
        return;
    }
    const std::size_t begin = out.size();
    appendNumber(out, real);
    if (out.view().substr(begin).find_first_of(".e") == std::string_view::npos)
        out.append(".0");
}

void appendBase64(TextBuffer& out, Bytes bytes) {
    const std::size_t size = base64Size(bytes.size());
    out.append('"');
    putBase64(out.room(size), bytes);
    out.advance(size);
    out.append('"');
}

void appendScalar(TextBuffer& out, const Value& value) {
    switch (value.kind()) {
    case ValueKind::Integer: appendNumber(out, *value.asInteger()); break;
    case ValueKind::Real: appendReal(out, *value.asReal()); break;
    case ValueKind::Boolean: out.append(*value.asBoolean() ? "true" : "false"); break;
    case ValueKind::Date: appendJsonString(out, isoText(*value.asDate())); break;
    case ValueKind::Data: appendBase64(out, value.asData()->bytes()); break;
    default: out.append("null"); break;
    }
}

/// Nothing but the punctuation.
struct OneLine {
    static constexpr std::string_view colon = ":";
    static void newLine(TextBuffer&, int) {}
};

struct Indented {
    static constexpr std::string_view colon = ": ";
    static void newLine(TextBuffer& out, int level) {
        out.append('\n');
        for (int i = 0; i < level; ++i)
            out.append("  ");
    }
};

template <class Layout>
void append(TextBuffer& out, const Value& value, int level) {
    if (const std::string* text = value.asString()) {
        appendJsonString(out, *text);
    } else if (const Dictionary* dictionary = value.asDictionary()) {
        char before = '{';
        for (const auto& [key, held] : *dictionary) {
            out.append(before);
            before = ',';
            Layout::newLine(out, level + 1);
            appendJsonString(out, key);
            out.append(Layout::colon);
            append<Layout>(out, held, level + 1);
        }
        if (dictionary->empty())
            out.append(before);
        else
            Layout::newLine(out, level);
        out.append('}');
    } else if (const Array* array = value.asArray()) {
        char before = '[';
        for (const Value& element : *array) {
            out.append(before);
            before = ',';
            Layout::newLine(out, level + 1);
            append<Layout>(out, element, level + 1);
        }
        if (array->empty())
            out.append(before);
        else
            Layout::newLine(out, level);
        out.append(']');
    } else {
        appendScalar(out, value);
    }
}

} // namespace

void appendJsonString(TextBuffer& out, std::string_view text) {
    char* const begin = out.room(text.size() + 2);
    *begin = '"';
    const std::size_t plain = copyPlain(begin + 1, text);
    if (plain == text.size()) {
        begin[1 + plain] = '"';
        out.advance(plain + 2);
        return;
    }
    out.advance(1 + plain);
    appendUnusual(out, text.substr(plain));
    out.append('"');
}

void appendJson(TextBuffer& out, const Value& value) {
    append<OneLine>(out, value, 0);
}

void appendIndentedJson(TextBuffer& out, const Value& value, int level) {
    append<Indented>(out, value, level);
}

} // namespace velmora
