#include "Telephony/DamagedRecords.h"

#include <vector>

namespace velmora {
namespace {

std::vector<std::uint8_t> bytesOf(const Data& message) {
    return {message.bytes().begin(), message.bytes().end()};
}

} // namespace

std::optional<Data> damagedMessage(Damage damage, GSMReportContext& context, Time moment) {
    const Data good = registrationReport(context)->message(moment);
    switch (damage) {
    case Damage::CutShort: {
        std::vector<std::uint8_t> bytes = bytesOf(good);
        bytes.resize(5);
        return Data(std::move(bytes));
    }
    case Damage::WrongType: {
        std::vector<std::uint8_t> bytes = bytesOf(good);
        bytes[0] = 2;
        return Data(std::move(bytes));
    }
    case Damage::BelowMinimum:
        return records::servingNetwork(0, records::ServiceType::CSAndPS, context.phone.area())
            .cutTo(31)
            .message(moment);
    case Damage::Prefixed: {
        std::vector<std::uint8_t> bytes = bytesOf(good);
        bytes.insert(bytes.begin(), {0x81, 0x00});
        return Data(std::move(bytes));
    }
    case Damage::CountOverrun: {
        // The count of a measurement record says two more than there are.
        std::optional<RecordBuilder> record = gsmMeasurementReport(context);
        if (!record)
            return std::nullopt;
        const auto entries = static_cast<std::int64_t>((record->size() - 29) / 14);
        return record->u8(28, entries + 2).message(moment);
    }
    case Damage::UnknownCode:
        return RecordBuilder(0x1375, 24).u32(13, context.random.between(0, 1 << 20)).message(moment);
    }
    return std::nullopt;
}

} // namespace velmora
