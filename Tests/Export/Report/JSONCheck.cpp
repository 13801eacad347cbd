// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Export/Report/PageCheck.h"

#include <cctype>

namespace velmora {

namespace {

/// A recogniser: RFC 8259, without what the page does not write (blanks but line feeds, exponents in
/// capitals).
class Recogniser {
public:
    explicit Recogniser(std::string_view text) : _rest(text) {}

    bool whole() { return value(0) && (blanks(), _rest.empty()); }

private:
    void blanks() {
        while (!_rest.empty() && (_rest.front() == '\n' || _rest.front() == ' '))
            _rest.remove_prefix(1);
    }
    bool take(std::string_view token) {
        blanks();
        if (!_rest.starts_with(token))
            return false;
        _rest.remove_prefix(token.size());
        return true;
    }
    bool value(int depth) {
        blanks();
        if (depth > 32 || _rest.empty())
            return false;
        switch (_rest.front()) {
        case '{': return members(depth);
        case '[': return elements(depth);
        case '"': return string();
        default: return take("null") || take("true") || take("false") || number();
        }
    }
    bool members(int depth) {
        if (!take("{"))
            return false;
        if (take("}"))
            return true;
        do {
            blanks();
            if (!string() || !take(":") || !value(depth + 1))
                return false;
        } while (take(","));
        return take("}");
    }
    bool elements(int depth) {
        if (!take("["))
            return false;
        if (take("]"))
            return true;
        do {
            if (!value(depth + 1))
                return false;
        } while (take(","));
        return take("]");
    }
    bool string() {
        if (!take("\""))
            return false;
        while (!_rest.empty() && _rest.front() != '"') {
            if (static_cast<unsigned char>(_rest.front()) < 0x20)
                return false;
            _rest.remove_prefix(_rest.front() == '\\' && _rest.size() > 1 ? 2 : 1);
        }
        return take("\"");
    }
    bool number() {
        std::size_t length = 0;
        bool hasDigit = false;
        for (; length < _rest.size(); ++length) {
            const char each = _rest[length];
            hasDigit = hasDigit || std::isdigit(static_cast<unsigned char>(each)) != 0;
            if (std::isdigit(static_cast<unsigned char>(each)) == 0 &&
                std::string_view("+-.e").find(each) == std::string_view::npos)
                break;
        }
        _rest.remove_prefix(length);
        return hasDigit;
    }

    std::string_view _rest;
};

} // namespace

bool isJSON(std::string_view text) {
    return Recogniser(text).whole();
}

} // namespace velmora
