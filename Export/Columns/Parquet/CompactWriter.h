// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <cstdint>
#include <memory>
#include <string>
#include <string_view>

namespace velmora {

/// Writes structures in Thrift's compact protocol. The members of a structure are written in the order of
/// their numbers.
class CompactWriter {
public:
    CompactWriter();
    ~CompactWriter();
    CompactWriter(const CompactWriter&) = delete;
    CompactWriter& operator=(const CompactWriter&) = delete;

    enum class Element : std::uint8_t { Integer, Text, Structure };

    void beginStructure();
    void endStructure();
    /// What follows is the member of that number.
    void integerMember(int number, std::int32_t value);
    void longMember(int number, std::int64_t value);
    void flagMember(int number, bool value);
    void textMember(int number, std::string_view value);
    /// The structure follows.
    void structureMember(int number);
    /// The elements follow, as many as that.
    void listMember(int number, Element element, std::size_t count);
    void integer(std::int32_t value);
    void text(std::string_view value);
    /// A structure without members.
    void emptyMember(int number);

    [[nodiscard]] std::string result() const;

private:
    struct Protocol;
    std::unique_ptr<Protocol> _protocol;
};

} // namespace velmora
