// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "LogGenerator/Fields/Place.h"

namespace velmora {

std::int64_t Place::read(const Record& record) const {
    if (isBigEndian)
        return record.u16BigEndian(offset);
    if (bit == 0) {
        switch (width) {
        case 8: return isSigned ? std::int64_t{record.i8(offset)} : record.u8(offset);
        case 16: return isSigned ? std::int64_t{record.i16(offset)} : record.u16(offset);
        case 32: return isSigned ? std::int64_t{record.i32(offset)} : record.u32(offset);
        default: break;
        }
    }
    return record.bits(offset, bit, width);
}

} // namespace velmora
