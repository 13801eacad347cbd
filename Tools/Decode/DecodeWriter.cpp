// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Decode/DecodeWriter.h"

#include "Platform/PrintableText.h"
#include "Tools/Decode/CSVRows.h"
#include "Tools/Decode/FinalDisplay.h"
#include "Tools/Decode/JSONLines.h"
#include "Tools/Decode/Samples/SampleLines.h"
#include "Tools/Decode/Samples/SampleRows.h"
#include "Tools/Decode/Samples/WideRows.h"
#include "Tools/Output.h"
#include "Tools/Report.h"

#include <string>

namespace velmora {

std::unique_ptr<DecodeWriter> DecodeWriter::make(const DecodeOptions& options, std::size_t index, bool isLive,
                                                 SampleColumns& columns, Output& output) {
    using Format = DecodeOptions::Format;
    const std::string named = options.files.size() > 1 ? options.files[index] : std::string();
    if (options.samples == DecodeOptions::Samples::Wide)
        return std::make_unique<WideRows>(output, isLive, options, named, columns);
    if (options.samples == DecodeOptions::Samples::Long && options.format == Format::Csv)
        return std::make_unique<SampleRows>(output, isLive, options, named);
    if (options.samples == DecodeOptions::Samples::Long)
        return std::make_unique<SampleLines>(output, isLive, options, named);
    switch (options.format) {
    case Format::JsonLines:
        if (options.every == DecodeOptions::Every::Message)
            return std::make_unique<MessageLines>(output, isLive, options.selection, named);
        return std::make_unique<RefreshLines>(output, isLive, options, named);
    case Format::Csv: return std::make_unique<CSVRows>(output, isLive, options, named);
    case Format::Text:
    case Format::Json: break;
    }
    const std::string title = named.empty() ? std::string() : printable(fileTitle(named));
    return std::make_unique<FinalDisplay>(output, options, title, index == 0);
}

bool DecodeWriter::isDone() const {
    return !_output.isOpen();
}

} // namespace velmora
