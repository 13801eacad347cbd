#pragma once

#include "Tools/Decoding.h"

#include <string>
#include <vector>

namespace velmora {

class Output;

/// `velmora-log decode`: runs each file through its technology's decoder and shows what the screens show in
/// the end.
struct DecodeOptions {
    enum class Format { Text, Json };
    Format format = Format::Text;
    std::string technology; ///< before the one that the file names; empty for that one
    std::vector<std::string> files;
};

/// The exit status. One file's trouble does not keep the others from being decoded.
[[nodiscard]] int runDecode(const DecodeOptions& options, Output& output);

/// What is printed of a file: a JSON object, or the display tree; each ends in a line feed unless it is
/// empty.
[[nodiscard]] std::string decodedJson(const Decoded& decoded);
[[nodiscard]] std::string decodedText(const Decoded& decoded);

} // namespace velmora
