// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Platform/Bytes.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <stdexcept>
#include <string>

namespace velmora {

/// The bytes are no such structure.
class MalformedStructure final : public std::runtime_error {
public:
    using std::runtime_error::runtime_error;
};

/// Reads structures in Thrift's compact protocol. Each operation throws MalformedStructure where something
/// else follows than it reads.
class CompactReader {
public:
    /// The bytes must outlive it.
    explicit CompactReader(Bytes bytes);
    ~CompactReader();
    CompactReader(const CompactReader&) = delete;
    CompactReader& operator=(const CompactReader&) = delete;

    /// Calls `member` with the number of each member of a structure. It reads the member, or returns false,
    /// and the member is skipped.
    void structure(const std::function<bool(int number)>& member);
    /// Calls `element` for each element of a list, which it reads.
    void list(const std::function<void()>& element);
    [[nodiscard]] std::int32_t integer();
    [[nodiscard]] std::int64_t longInteger();
    [[nodiscard]] bool flag();
    [[nodiscard]] std::string text();

private:
    struct Protocol;
    std::unique_ptr<Protocol> _protocol;
};

} // namespace velmora
