// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Recording/Files/ByteSource.h"
#include "Recording/Files/ChunkedInput.h"

#include <memory>
#include <optional>
#include <string>

namespace velmora {

/// Whether the input begins as gzip'd data does (RFC 1952).
[[nodiscard]] bool isGzip(Bytes begin);

/// What gzip'd data unpacks to: all members, one after another, as gzip does. Zero bytes after the last one
/// are padding. Memory is bounded, whatever the data unpacks to. Main thread only.
class GzipSource final : public ByteSource {
public:
    /// Reads an input of which nothing has been skipped.
    explicit GzipSource(ChunkedInput input);
    ~GzipSource() override;
    GzipSource(const GzipSource&) = delete;
    GzipSource& operator=(const GzipSource&) = delete;

    /// Fails for data that is damaged or ends early, after the bytes before that have been returned.
    Result<std::size_t> read(std::span<std::uint8_t> buffer) override;

private:
    struct Inflater;

    [[nodiscard]] std::size_t inflateInto(std::span<std::uint8_t> buffer);
    /// Prepares for another member. Returns whether there is one.
    [[nodiscard]] bool beginMember();
    void fail(const std::string& what, const char* place = "at");

    ChunkedInput _input;
    std::unique_ptr<Inflater> _inflater;
    bool _inMember = false;
    bool _isFirst = true; ///< no member has been read
    std::optional<Failure> _failure;
};

} // namespace velmora
