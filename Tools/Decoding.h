#pragma once

#include "Platform/Clock.h"
#include "Platform/Result.h"
#include "Platform/Value.h"
#include "Recording/MessageReader.h"

#include <cstdint>
#include <functional>
#include <memory>
#include <string>

namespace velmora {

class WorkContext;

/// What came of decoding a file.
struct Decoded {
    std::string technology; ///< the short name
    std::uint64_t messages = 0;
    Value display; ///< as it stands after the last message; none where there was nothing to show
};

/// Told of every refresh, with its tick and the display as it then stands. The display's nodes are the
/// decoder's own: they change with the next message.
using RefreshAction = std::function<void(Time tick, const Value& display)>;

/// Runs a file's messages through the decoder of its technology, and refreshes as the application does while
/// they arrive. `technology`, unless empty, goes before the one that the file names. `context` is kept at the
/// record at hand. Fails, before anything is decoded, when there is no decoder; exceptions of the decoders
/// pass through.
[[nodiscard]] Result<Decoded> decodeMessages(MessageReader& reader, const std::string& technology,
                                             WorkContext& context, const RefreshAction& refreshed = {});

/// Tells the user what the reader had to leave out of the file, and how it ended. Whether all of it was read.
bool reportLosses(const MessageReader& reader, const std::string& title);

} // namespace velmora
