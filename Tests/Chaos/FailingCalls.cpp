// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

// Preloaded into a program (LD_PRELOAD), this makes chosen calls of it fail: the N-th of a kind, once, a few
// times in a row, or for good. What is counted begins with `main`, so that N means the same in every run, and
// includes all threads and the children that the program forks.
//
//   VELMORA_FAIL="KIND AT TIMES ERRNO"
//       KIND   memory, read, write, sync, rename or open
//       AT     the first call that fails, from 1; 0 for none
//       TIMES  how many fail; 0 for all that follow
//   VELMORA_FAIL_COUNT=FILE
//       16 bytes: how many calls of the kind there were, how many of them failed
//   VELMORA_FAIL_ASKED
//       set: counts only between velmoraCountCalls(1) and velmoraCountCalls(0)
//
// Reads and writes are those of regular files and of standard input and output. Those of sockets and of the
// event loop's own descriptors are not: what becomes of a connection is tried by killing the other end. Nor
// are those of standard error, which is where the program has to report the failure. Memory that Qt asks the
// C library for by itself is left alone: it does not look whether it got it (QObject::connect does not), so
// that nothing above it could. What it gets with `new` is counted, but for what a QWaitCondition consists of:
// Qt's record of a thread has one, and its clean-up after that failure follows a pointer that is not set yet.
// For the main thread this is while the event loop is made, before a program has opened anything.

// The fortified headers define some of these themselves.
#undef _FORTIFY_SOURCE

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <cstdarg>
#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <iterator>
#include <new>

#include <dlfcn.h>
#include <fcntl.h>
#include <link.h>
#include <sys/mman.h>
#include <sys/stat.h>
#include <sys/uio.h>
#include <unistd.h>

extern "C" {
// NOLINTBEGIN(bugprone-reserved-identifier) the C library's own names for what this library stands before
void* __libc_malloc(std::size_t size);
void* __libc_calloc(std::size_t count, std::size_t size);
void* __libc_realloc(void* memory, std::size_t size);
void* __libc_memalign(std::size_t alignment, std::size_t size);
// NOLINTEND(bugprone-reserved-identifier)
}

namespace {

enum class Kind { None, Memory, Read, Write, Sync, Rename, Open };
constexpr const char* kindNames[] = {"none", "memory", "read", "write", "sync", "rename", "open"};

struct Counts {
    std::atomic<std::uint64_t> calls;
    std::atomic<std::uint64_t> failed;
};

// Nothing of this has a constructor or a destructor: the first calls come before the one, the last after the
// other.
constinit Counts ownCounts{};
constinit Counts* counts = &ownCounts;
constinit std::atomic<bool> counting{false};
constinit Kind chosen = Kind::None;
constinit std::uint64_t firstFailure = 0;
constinit std::uint64_t failures = 0; ///< 0 for all that follow
constinit int failureError = EIO;

/// Where a library's code lies.
struct Code {
    std::uintptr_t begin;
    std::uintptr_t end;
};
constinit Code spared[8] = {};
constinit std::size_t sparedCount = 0;

int noteSpared(dl_phdr_info* library, std::size_t, void*) {
    if (!std::strstr(library->dlpi_name, "/libQt6"))
        return 0;
    for (int i = 0; i < library->dlpi_phnum; ++i) {
        const auto& part = library->dlpi_phdr[i];
        if (part.p_type == PT_LOAD && (part.p_flags & PF_X) != 0 && sparedCount < std::size(spared)) {
            const std::uintptr_t begin = library->dlpi_addr + part.p_vaddr;
            spared[sparedCount++] = {begin, begin + part.p_memsz};
        }
    }
    return 0;
}

bool isSpared(const void* caller) {
    const auto address = reinterpret_cast<std::uintptr_t>(caller);
    return std::any_of(spared, spared + sparedCount,
                       [=](const Code& code) { return address >= code.begin && address < code.end; });
}

int (*realMain)(int, char**, char**) = nullptr;

/// Whether this call is to fail; `errno` is set then.
bool fails(Kind kind) {
    if (kind != chosen || !counting.load(std::memory_order_relaxed))
        return false;
    const std::uint64_t number = ++counts->calls;
    if (firstFailure == 0 || number < firstFailure || (failures != 0 && number >= firstFailure + failures))
        return false;
    ++counts->failed;
    errno = failureError;
    return true;
}

bool isCounted(int descriptor) {
    if (descriptor == STDIN_FILENO || descriptor == STDOUT_FILENO)
        return true;
    struct stat status = {};
    const int before = errno;
    const bool isRegular = ::fstat(descriptor, &status) == 0 && S_ISREG(status.st_mode);
    errno = before;
    return isRegular && descriptor != STDERR_FILENO;
}

bool fails(Kind kind, int descriptor) {
    return kind == chosen && counting.load(std::memory_order_relaxed) && isCounted(descriptor) && fails(kind);
}

bool isOfWaitCondition(const void* caller) {
    Dl_info place = {};
    return isSpared(caller) && ::dladdr(caller, &place) != 0 && place.dli_sname &&
           std::strstr(place.dli_sname, "14QWaitConditionC");
}

bool failsFor(const void* caller) {
    return chosen == Kind::Memory && !isSpared(caller) && fails(Kind::Memory);
}

template <class Function>
Function* next(Function*, const char* name) {
    return reinterpret_cast<Function*>(::dlsym(RTLD_NEXT, name));
}

void configure() {
    const char* const wish = std::getenv("VELMORA_FAIL");
    char kind[16] = "none";
    unsigned long long at = 0;
    unsigned long long times = 0;
    if (!wish || std::sscanf(wish, "%15s %llu %llu %d", kind, &at, &times, &failureError) != 4)
        return;
    firstFailure = at;
    failures = times;
    for (std::size_t i = 0; i < sizeof kindNames / sizeof kindNames[0]; ++i)
        if (std::strcmp(kind, kindNames[i]) == 0)
            chosen = static_cast<Kind>(i);
    if (const char* const place = std::getenv("VELMORA_FAIL_COUNT")) {
        const int file = ::open(place, O_RDWR | O_CLOEXEC);
        void* const shared = ::mmap(nullptr, sizeof(Counts), PROT_READ | PROT_WRITE, MAP_SHARED, file, 0);
        ::close(file);
        if (shared != MAP_FAILED)
            counts = static_cast<Counts*>(shared);
    }
    ::dl_iterate_phdr(noteSpared, nullptr);
    counting = std::getenv("VELMORA_FAIL_ASKED") == nullptr;
}

int countedMain(int count, char** arguments, char** environment) {
    configure();
    const int status = realMain(count, arguments, environment);
    counting = false;
    return status;
}

mode_t modeOf(int flags, std::va_list arguments) {
    return (flags & O_CREAT) != 0 || (flags & O_TMPFILE) == O_TMPFILE
               ? static_cast<mode_t>(va_arg(arguments, unsigned))
               : 0;
}

} // namespace

extern "C" {

// The C library's names again; those that it gives their parameters say little.
// NOLINTBEGIN(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name)

void velmoraCountCalls(int isCounting) {
    counting = isCounting != 0;
}

int __libc_start_main(int (*programMain)(int, char**, char**), int count, char** arguments, void (*init)(),
                      void (*fini)(), void (*runtimeFini)(), void* stackEnd) {
    realMain = programMain;
    return next(&__libc_start_main, "__libc_start_main")(countedMain, count, arguments, init, fini,
                                                         runtimeFini, stackEnd);
}

void* malloc(std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_malloc(size);
}

void* calloc(std::size_t count, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_calloc(count, size);
}

void* realloc(void* memory, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_realloc(memory, size);
}

void* aligned_alloc(std::size_t alignment, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_memalign(alignment, size);
}

void* memalign(std::size_t alignment, std::size_t size) {
    return failsFor(__builtin_return_address(0)) ? nullptr : __libc_memalign(alignment, size);
}

int posix_memalign(void** memory, std::size_t alignment, std::size_t size) {
    void* const made = failsFor(__builtin_return_address(0)) ? nullptr : __libc_memalign(alignment, size);
    if (!made)
        return ENOMEM;
    *memory = made;
    return 0;
}

ssize_t read(int descriptor, void* buffer, std::size_t size) {
    return fails(Kind::Read, descriptor) ? -1 : next(&read, "read")(descriptor, buffer, size);
}

ssize_t __read_chk(int descriptor, void* buffer, std::size_t size, std::size_t) {
    return read(descriptor, buffer, size);
}

ssize_t pread(int descriptor, void* buffer, std::size_t size, off_t offset) {
    return fails(Kind::Read, descriptor) ? -1 : next(&pread, "pread")(descriptor, buffer, size, offset);
}

ssize_t pread64(int descriptor, void* buffer, std::size_t size, off64_t offset) {
    return pread(descriptor, buffer, size, offset);
}

ssize_t __pread_chk(int descriptor, void* buffer, std::size_t size, off_t offset, std::size_t) {
    return pread(descriptor, buffer, size, offset);
}

ssize_t write(int descriptor, const void* bytes, std::size_t size) {
    return fails(Kind::Write, descriptor) ? -1 : next(&write, "write")(descriptor, bytes, size);
}

ssize_t writev(int descriptor, const iovec* parts, int count) {
    return fails(Kind::Write, descriptor) ? -1 : next(&writev, "writev")(descriptor, parts, count);
}

ssize_t pwrite(int descriptor, const void* bytes, std::size_t size, off_t offset) {
    return fails(Kind::Write, descriptor) ? -1 : next(&pwrite, "pwrite")(descriptor, bytes, size, offset);
}

ssize_t pwrite64(int descriptor, const void* bytes, std::size_t size, off64_t offset) {
    return pwrite(descriptor, bytes, size, offset);
}

int fsync(int descriptor) {
    return fails(Kind::Sync) ? -1 : next(&fsync, "fsync")(descriptor);
}

int fdatasync(int descriptor) {
    return fails(Kind::Sync) ? -1 : next(&fdatasync, "fdatasync")(descriptor);
}

int rename(const char* from, const char* to) noexcept {
    return fails(Kind::Rename) ? -1 : next(&rename, "rename")(from, to);
}

int renameat2(int fromDirectory, const char* from, int toDirectory, const char* to, unsigned flags) noexcept {
    return fails(Kind::Rename) ? -1
                               : next(&renameat2, "renameat2")(fromDirectory, from, toDirectory, to, flags);
}

int open(const char* path, int flags, ...) {
    std::va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return fails(Kind::Open) ? -1 : next(&open, "open")(path, flags, mode);
}

int open64(const char* path, int flags, ...) {
    std::va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return open(path, flags, mode);
}

int __open_2(const char* path, int flags) {
    return open(path, flags);
}

int __open64_2(const char* path, int flags) {
    return open(path, flags);
}

int mkostemp(char* pattern, int flags) {
    return fails(Kind::Open) ? -1 : next(&mkostemp, "mkostemp")(pattern, flags);
}

int mkostemp64(char* pattern, int flags) {
    return mkostemp(pattern, flags);
}

// NOLINTEND(bugprone-reserved-identifier,readability-inconsistent-declaration-parameter-name)

} // extern "C"

// Stood before as well, so that the caller is known to be a function of Qt and not the C++ library.
void* operator new(std::size_t size) {
    const void* const caller = __builtin_return_address(0);
    const bool isFailing = chosen == Kind::Memory && !isOfWaitCondition(caller) && fails(Kind::Memory);
    void* const memory = isFailing ? nullptr : __libc_malloc(size);
    if (!memory)
        throw std::bad_alloc();
    return memory;
}

void operator delete(void* memory) noexcept {
    std::free(memory);
}

void operator delete(void* memory, std::size_t) noexcept {
    std::free(memory);
}
