// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <string>
#include <utility>
#include <variant>

namespace velmora {

/// Why something could not be done: lower-case prose without a full stop with the found and the expected
/// value, to be appended to "file: " in a message.
struct Failure {
    std::string reason;
};

/// The outcome of something that can fail for reasons outside the program: a value, or one reason. Test it
/// before use; reading the value of a failure is a programming error and throws std::bad_variant_access.
template <class T>
class [[nodiscard]] Result {
public:
    Result(T value) : _outcome(std::in_place_index<0>, std::move(value)) {}
    Result(Failure failure) : _outcome(std::in_place_index<1>, std::move(failure)) {}

    [[nodiscard]] explicit operator bool() const { return _outcome.index() == 0; }

    [[nodiscard]] T& operator*() & { return std::get<0>(_outcome); }
    [[nodiscard]] const T& operator*() const& { return std::get<0>(_outcome); }
    [[nodiscard]] T&& operator*() && { return std::get<0>(std::move(_outcome)); }
    [[nodiscard]] T* operator->() { return &std::get<0>(_outcome); }
    [[nodiscard]] const T* operator->() const { return &std::get<0>(_outcome); }

    [[nodiscard]] const std::string& reason() const { return std::get<1>(_outcome).reason; }

private:
    std::variant<T, Failure> _outcome;
};

/// The value of a result without a value.
struct Done {};

} // namespace velmora
