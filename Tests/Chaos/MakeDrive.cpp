#include "Recording/RecordingWriter.h"
#include "Telephony/DriveScenario.h"
#include "Telephony/ScenarioRegistry.h"

#include <chrono>
#include <cstdio>
#include <cstdlib>

/// Writes the first hours of a scenario's drive as a recording: make-drive SCENARIO HOURS FILE. The same
/// words give the same file; a FILE of - is standard output, so that a long drive need not be stored.
int main(int count, char** arguments) {
    using namespace velmora;
    const ScenarioKind* const kind = count == 4 ? scenarioKindNamed(arguments[1]) : nullptr;
    if (!kind) {
        std::fprintf(stderr, "usage: make-drive SCENARIO HOURS FILE; scenarios: %s\n",
                     scenarioNames().c_str());
        return 2;
    }
    const std::chrono::duration<double, std::ratio<3600>> length(std::strtod(arguments[2], nullptr));
    const auto scenario = kind->make(1);
    const auto writer = RecordingWriter::create(arguments[3], scenario->technology());
    Result<Done> written = writer ? Result<Done>(Done{}) : Result<Done>(Failure{writer.reason()});
    for (ScenarioEvent event = scenario->next(); written && event.offset < length; event = scenario->next())
        written = (*writer)->append(DriveScenario::beginning() + event.offset, event.message.bytes());
    if (written)
        written = (*writer)->close();
    if (!written)
        std::fprintf(stderr, "make-drive: %s\n", written.reason().c_str());
    return written ? 0 : 1;
}
