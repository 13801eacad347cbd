#include "Tools/Report.h"

#include "Tools/ExitStatus.h"

#include <cerrno>
#include <cstdlib>
#include <exception>
#include <utility>

#include <unistd.h>

namespace velmora {

namespace {

// The terminate handler has no other way to find it.
WorkContext* currentContext = nullptr;

} // namespace

void report(std::string_view text) {
    std::string line = "velmora-log: ";
    line += text;
    line += '\n';
    std::string_view rest = line;
    while (!rest.empty()) {
        const auto written = ::write(STDERR_FILENO, rest.data(), rest.size());
        if (written >= 0)
            rest.remove_prefix(static_cast<std::size_t>(written));
        else if (errno != EINTR)
            return; // there is nowhere left to say so
    }
}

std::string fileTitle(const std::string& path) {
    return path == "-" ? "standard input" : path;
}

std::string placeInFile(std::string_view title, std::uint64_t number, std::uint64_t offset) {
    std::string place(title);
    if (number != 0)
        place += ": record " + std::to_string(number) + " at offset " + std::to_string(offset);
    return place;
}

WorkContext::WorkContext(std::string title, std::function<void()> cleanUp)
    : _title(std::move(title)), _cleanUp(std::move(cleanUp)), _earlier(std::exchange(currentContext, this)) {}

WorkContext::~WorkContext() {
    currentContext = _earlier;
}

void WorkContext::takeOverTermination() {
    std::set_terminate(&WorkContext::terminate);
}

void WorkContext::terminate() noexcept {
    // A failure while cleaning up must not come back here.
    std::set_terminate([] { std::_Exit(ExitStatus::BadInput); });
    std::string reason = "unexpected end";
    if (const std::exception_ptr exception = std::current_exception()) {
        try {
            std::rethrow_exception(exception);
        } catch (const std::exception& error) {
            reason = error.what();
        } catch (...) {
            reason = "unknown failure";
        }
    }
    std::string place;
    if (const WorkContext* context = currentContext) {
        if (context->_cleanUp)
            context->_cleanUp();
        place = placeInFile(context->_title, context->_number, context->_offset) + ": ";
    }
    report(place + reason);
    // No destructor runs: the program's objects are as the failure left them.
    std::_Exit(ExitStatus::BadInput);
}

} // namespace velmora
