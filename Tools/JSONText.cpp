#include "Tools/JSONText.h"

#include "Platform/Clock.h"

#include <nlohmann/json.hpp>

#include <chrono>

namespace velmora {

namespace {

using Json = nlohmann::json;

std::string dump(const Json& scalar) {
    return scalar.dump(-1, ' ', false, Json::error_handler_t::replace);
}

std::string base64(Bytes bytes) {
    static constexpr char digits[] = "ABCDEFGHIJKLMNOPQRSTUVWXYZabcdefghijklmnopqrstuvwxyz0123456789+/";
    std::string text;
    text.reserve((bytes.size() + 2) / 3 * 4);
    for (std::size_t i = 0; i < bytes.size(); i += 3) {
        const std::size_t present = std::min<std::size_t>(bytes.size() - i, 3);
        std::uint32_t group = 0;
        for (std::size_t j = 0; j < 3; ++j)
            group = group << 8 | (j < present ? bytes[i + j] : 0U);
        for (std::size_t j = 0; j < 4; ++j)
            text += j <= present ? digits[group >> (18 - 6 * j) & 0x3F] : '=';
    }
    return text;
}

std::string iso8601(Date date) {
    // "2026-11-16 05:00:00 +0000" with the standard's separators. The description holds every year's digits.
    std::string text = dateDescription(date);
    text.resize(text.rfind(' '));
    text += 'Z';
    text[text.find(' ')] = 'T';
    return text;
}

/// Appends as it goes: a display of many rows is not built twice.
class Writer {
public:
    explicit Writer(std::string& out) : _out(out) {}

    void write(const Value& value, int level) {
        switch (value.kind()) {
        case ValueKind::None: _out += "null"; break;
        case ValueKind::String: _out += jsonString(*value.asString()); break;
        case ValueKind::Integer: _out += std::to_string(*value.asInteger()); break;
        case ValueKind::Real: _out += dump(*value.asReal()); break;
        case ValueKind::Boolean: _out += *value.asBoolean() ? "true" : "false"; break;
        case ValueKind::Date: _out += jsonString(iso8601(*value.asDate())); break;
        case ValueKind::Data: _out += jsonString(base64(value.asData()->bytes())); break;
        case ValueKind::Array: writeArray(*value.asArray(), level); break;
        case ValueKind::Dictionary: writeDictionary(*value.asDictionary(), level); break;
        }
    }

private:
    void writeArray(const Array& array, int level) {
        bool first = true;
        _out += '[';
        for (const Value& element : array) {
            startItem(first, level + 1);
            write(element, level + 1);
        }
        end(first, level, ']');
    }

    void writeDictionary(const Dictionary& dictionary, int level) {
        bool first = true;
        _out += '{';
        for (const auto& [key, value] : dictionary) {
            startItem(first, level + 1);
            _out += jsonString(key);
            _out += ": ";
            write(value, level + 1);
        }
        end(first, level, '}');
    }

    void startItem(bool& first, int level) {
        if (!first)
            _out += ',';
        first = false;
        newLine(level);
    }

    void end(bool empty, int level, char bracket) {
        if (!empty)
            newLine(level);
        _out += bracket;
    }

    void newLine(int level) {
        _out += '\n';
        _out.append(2 * static_cast<std::size_t>(level), ' ');
    }

    std::string& _out;
};

} // namespace

std::string jsonString(std::string_view text) {
    return dump(Json(text));
}

std::string jsonText(const Value& value, int level) {
    std::string text;
    Writer(text).write(value, level);
    return text;
}

} // namespace velmora
