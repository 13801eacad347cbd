// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include <unistd.h>

#include <utility>

namespace velmora {

/// Owns a file descriptor and closes it. Move-only; -1 means none.
class FileDescriptor {
public:
    FileDescriptor() = default;
    explicit FileDescriptor(int descriptor) : _descriptor(descriptor) {}
    FileDescriptor(FileDescriptor&& other) noexcept : _descriptor(std::exchange(other._descriptor, -1)) {}
    FileDescriptor& operator=(FileDescriptor&& other) noexcept {
        if (this != &other) {
            reset();
            _descriptor = std::exchange(other._descriptor, -1);
        }
        return *this;
    }
    ~FileDescriptor() { reset(); }

    [[nodiscard]] int get() const { return _descriptor; }
    [[nodiscard]] explicit operator bool() const { return _descriptor >= 0; }

    void reset() {
        if (_descriptor >= 0)
            ::close(std::exchange(_descriptor, -1));
    }

private:
    int _descriptor = -1;
};

} // namespace velmora
