// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Export/Report/DriveReport.h"
#include "Export/Report/Page/Markup.h"
#include "Export/Report/TimeSpans.h"

#include <cstdint>
#include <functional>
#include <string>
#include <string_view>

namespace velmora {

/// Writes a report as one HTML page that needs nothing beside itself.
class PageWriter {
public:
    /// The report must outlive it.
    PageWriter(const DriveReport& report, std::function<void(std::string_view)> put)
        : _report(report), _out(std::move(put)) {}

    void write();

private:
    void writeHead();

    const DriveReport& _report;
    Markup _out;
};

/// "sha256-..." of a part of the page, for its security policy.
[[nodiscard]] std::string sourceHash(std::string_view content);

} // namespace velmora
