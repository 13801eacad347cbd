#include "Tools/DecodeCommand.h"

#include "Recording/OpenMessages.h"
#include "Tools/ExitStatus.h"
#include "Tools/JSONText.h"
#include "Tools/Output.h"
#include "Tools/PrintableText.h"
#include "Tools/Report.h"
#include "Tools/TreeText.h"

#include <memory>

namespace velmora {

namespace {

/// Decodes one file and prints it. Whether its input was good.
bool decodeFile(const std::string& path, const DecodeOptions& options, const std::string& heading,
                Output& output) {
    const std::string title = fileTitle(path);
    const Result<std::unique_ptr<MessageReader>> reader = openMessages(path);
    if (!reader) {
        report(title + ": " + reader.reason());
        return false;
    }
    WorkContext context(title);
    const Result<Decoded> decoded = decodeMessages(**reader, options.technology, context);
    if (decoded) {
        const bool asJson = options.format == DecodeOptions::Format::Json;
        output.put(asJson ? decodedJson(*decoded) : heading + decodedText(*decoded));
        output.flush();
    } else {
        report(title + ": " + decoded.reason());
    }
    const bool whole = reportLosses(**reader, title);
    return decoded && whole;
}

} // namespace

int runDecode(const DecodeOptions& options, Output& output) {
    bool good = true;
    const bool severalFiles = options.files.size() > 1;
    std::string separator;
    for (const std::string& path : options.files) {
        std::string heading;
        if (severalFiles)
            heading = separator + "== " + printable(fileTitle(path)) + " ==\n";
        separator = "\n";
        good = decodeFile(path, options, heading, output) && good;
        if (!output.isOpen())
            break;
    }
    return good && output.state() != Output::State::Failed ? ExitStatus::Done : ExitStatus::BadInput;
}

std::string decodedJson(const Decoded& decoded) {
    std::string text = "{\n  \"technology\": " + jsonString(decoded.technology);
    text += ",\n  \"messages\": " + std::to_string(decoded.messages);
    text += ",\n  \"display\": ";
    // Nothing to show is an empty display, so that a reader of the object finds one whatever the file held.
    text += decoded.display.isNone() ? "{}" : jsonText(decoded.display, 1);
    text += "\n}\n";
    return text;
}

std::string decodedText(const Decoded& decoded) {
    if (decoded.display.isNone())
        return {};
    PathDictionary paths;
    return treeText(*VelmoraModelNode::makeTreeFromObject(decoded.display, paths));
}

} // namespace velmora
