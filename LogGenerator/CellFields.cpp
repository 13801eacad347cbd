#include "LogGenerator/CellFields.h"

#include "LogGenerator/ExtraPayload.h"
#include "Platform/SystemLog.h"

namespace velmora {

namespace {

std::int64_t part(std::int32_t number, CellNumber wanted) {
    switch (wanted) {
    case CellNumber::Low16: return static_cast<std::uint16_t>(number);
    case CellNumber::SignedLow16: return static_cast<std::int16_t>(number);
    case CellNumber::Whole: break;
    }
    return number;
}

} // namespace

void writeCellFields(Dictionary* node, const Dictionary& cell, std::span<const CellField> fields) {
    for (const CellField& field : fields) {
        const auto number = cellNumber(cell, field.key);
        if (!number)
            logLine(LogPriority::Error, field.failure);
        else if (node)
            writeValue(*node, field.label, field.show, part(*number, field.number));
    }
}

} // namespace velmora
