// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "LogGenerator/OstrelLogGenerator2.h"
#include "Platform/TelephonyService.h"

namespace velmora {

/// The decoder of the technology Ostrel UTRAN2 (TD-SCDMA). Its template has no fixed name: it is the first of
/// the application's property-list resources whose name contains "UTRAN" in whatever case.
class UTRANLogGenerator final : public OstrelLogGenerator2 {
public:
    /// Null, with an error line, where there is no such template.
    [[nodiscard]] std::string_view technology() const override {
        return kVoxLogChannelTechnology_Ostrel_UTRAN2;
    }
    [[nodiscard]] static std::unique_ptr<UTRANLogGenerator> generator(const Clock& clock);

private:
    UTRANLogGenerator(std::string templateName, const Clock& clock);
};

} // namespace velmora
