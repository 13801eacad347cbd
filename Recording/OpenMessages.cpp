#include "Recording/OpenMessages.h"

#include "Recording/FileSource.h"
#include "Recording/RecordingReader.h"

#include <utility>

namespace velmora {

Result<std::unique_ptr<MessageReader>> openMessages(const std::string& path) {
    Result<std::unique_ptr<ByteSource>> source = FileSource::open(path);
    if (!source)
        return Failure{source.reason()};
    Result<std::unique_ptr<RecordingReader>> recording =
        RecordingReader::open(ChunkedInput(*std::move(source)));
    if (!recording)
        return Failure{recording.reason()};
    return std::unique_ptr<MessageReader>(*std::move(recording));
}

} // namespace velmora
