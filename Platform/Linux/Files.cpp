#include "Platform/Linux/Files.h"

#include "Platform/Linux/Errno.h"
#include "Platform/Linux/FileDescriptor.h"

#include <fcntl.h>
#include <sys/stat.h>

#include <algorithm>
#include <cerrno>
#include <cstdlib>
#include <string>
#include <utility>
#include <vector>

namespace velmora {

namespace {

Result<Done> writeAll(const FileDescriptor& file, Bytes content) {
    while (!content.empty()) {
        const auto count = ::write(file.get(), content.data(), content.size());
        if (count >= 0)
            content = content.subspan(static_cast<std::size_t>(count));
        else if (errno != EINTR)
            return Failure{"cannot be written: " + errnoText(errno)};
    }
    return Done();
}

} // namespace

Result<Data> readFile(const std::filesystem::path& path, std::size_t maximumBytes) {
    FileDescriptor file(::open(path.c_str(), O_RDONLY | O_CLOEXEC));
    if (!file)
        return Failure{"cannot be opened: " + errnoText(errno)};
    // The size that the system gives is no promise: read until the end, one byte past what is allowed at
    // most.
    std::vector<std::uint8_t> content;
    std::size_t size = 0;
    for (;;) {
        constexpr std::size_t step = std::size_t{64} << 10;
        content.resize(size + std::min(std::max(step, size), maximumBytes - size) + 1);
        const auto count = ::read(file.get(), content.data() + size, content.size() - size);
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return Failure{"cannot be read: " + errnoText(errno)};
        if (count == 0)
            break;
        size += static_cast<std::size_t>(count);
        if (size > maximumBytes)
            return Failure{"more than " + std::to_string(maximumBytes) + " bytes"};
    }
    content.resize(size);
    content.shrink_to_fit();
    return Data(std::move(content));
}

Result<Done> writeFile(const std::filesystem::path& path, Bytes content) {
    FileDescriptor file(::open(path.c_str(), O_WRONLY | O_CREAT | O_TRUNC | O_CLOEXEC, 0666));
    if (!file)
        return Failure{"cannot be opened for writing: " + errnoText(errno)};
    return writeAll(file, content);
}

Result<Done> replaceFile(const std::filesystem::path& path, Bytes content) {
    std::string draft = path.string() + ".XXXXXX";
    const FileDescriptor file(::mkostemp(draft.data(), O_CLOEXEC));
    if (!file)
        return Failure{"cannot be opened for writing: " + errnoText(errno)};
    const auto fail = [&draft](Failure failure) {
        ::unlink(draft.c_str());
        return failure;
    };
    struct stat earlier = {};
    const bool existed = ::stat(path.c_str(), &earlier) == 0;
    if (existed && ::fchmod(file.get(), earlier.st_mode & 07777) != 0)
        return fail({"cannot be given its permissions: " + errnoText(errno)});
    if (const auto written = writeAll(file, content); !written)
        return fail({written.reason()});
    // The content is on the disk before the name leads to it.
    if (::fsync(file.get()) != 0 || ::rename(draft.c_str(), path.c_str()) != 0)
        return fail({"cannot be replaced: " + errnoText(errno)});
    return Done();
}

} // namespace velmora
