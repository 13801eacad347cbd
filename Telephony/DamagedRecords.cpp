#include "Telephony/DamagedRecords.h"

#include <vector>

namespace velmora {
namespace {

std::vector<std::uint8_t> bytesOf(const Data& message) {
    return {message.bytes().begin(), message.bytes().end()};
}

} // namespace

std::optional<Data> damagedMessage(Damage damage, const DamageMaterial& material, Time moment) {
    switch (damage) {
    case Damage::CutShort: {
        std::vector<std::uint8_t> bytes = bytesOf(material.good.message(moment));
        bytes.resize(5);
        return Data(std::move(bytes));
    }
    case Damage::WrongType: {
        std::vector<std::uint8_t> bytes = bytesOf(material.good.message(moment));
        bytes[0] = 2;
        return Data(std::move(bytes));
    }
    case Damage::BelowMinimum: return material.belowMinimum.message(moment);
    case Damage::Prefixed: {
        std::vector<std::uint8_t> bytes = bytesOf(material.good.message(moment));
        bytes.insert(bytes.begin(), {0x81, 0x00});
        return Data(std::move(bytes));
    }
    case Damage::CountOverrun:
        if (!material.overrun)
            return std::nullopt;
        return material.overrun->message(moment);
    case Damage::UnknownCode: return RecordBuilder(0x1375, 24).u32(13, material.noise).message(moment);
    }
    return std::nullopt;
}

std::optional<Data> damagedMessage(Damage damage, GSMReportContext& context, Time moment) {
    DamageMaterial material{
        *registrationReport(context),
        records::servingNetwork(0, records::ServiceType::CSAndPS, context.phone.area()).cutTo(31),
        gsmMeasurementReport(context)};
    // The count of a measurement record says two more than there are.
    if (material.overrun)
        material.overrun->u8(28, static_cast<std::int64_t>((material.overrun->size() - 29) / 14) + 2);
    if (damage == Damage::UnknownCode)
        material.noise = context.random.between(0, 1 << 20);
    return damagedMessage(damage, material, moment);
}

} // namespace velmora
