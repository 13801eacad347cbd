// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Export/Report/Page/PageWriter.h"

#include "Export/Report/Page/DataPart.h"
#include "Export/Report/Page/EventsPart.h"
#include "Export/Report/Page/PageFiles.h"
#include "Export/Report/Page/PicturesPart.h"
#include "Export/Report/Page/StatisticsPart.h"
#include "Export/Report/Page/SummaryPart.h"
#include "Export/Report/Page/TablesPart.h"
#include "Export/Report/Page/TrackPart.h"

#include <nettle/base64.h>
#include <nettle/sha2.h>

#include <array>
#include <cstdint>

namespace velmora {

std::string sourceHash(std::string_view content) {
    sha256_ctx context;
    nettle_sha256_init(&context);
    nettle_sha256_update(&context, content.size(), reinterpret_cast<const std::uint8_t*>(content.data()));
    std::array<std::uint8_t, SHA256_DIGEST_SIZE> digest{};
    nettle_sha256_digest(&context, digest.size(), digest.data());
    std::string encoded(BASE64_ENCODE_RAW_LENGTH(SHA256_DIGEST_SIZE), '\0');
    nettle_base64_encode_raw(encoded.data(), digest.size(), digest.data());
    return "sha256-" + encoded;
}

void PageWriter::writeHead() {
    _out.raw("<!DOCTYPE html>\n<html lang=\"en\">\n<head>\n<meta charset=\"utf-8\">\n"
             "<meta http-equiv=\"Content-Security-Policy\" content=\"default-src 'none'; script-src '");
    _out.raw(sourceHash(pageScript)).raw("'; style-src '").raw(sourceHash(pageStyle));
    _out.raw("'; base-uri 'none'; form-action 'none'\">\n"
             "<meta name=\"viewport\" content=\"width=device-width, initial-scale=1\">\n"
             "<meta name=\"color-scheme\" content=\"light dark\">\n"
             "<meta name=\"referrer\" content=\"no-referrer\">\n<meta name=\"generator\" content=\"");
    _out.text(_report.options().generator).raw("\">\n<title>");
    for (const ReportInput& input : _report.inputs())
        _out.text(input.name).raw(" ");
    _out.raw("– drive report</title>\n<style>").raw(pageStyle).raw("</style>\n</head>\n");
}

void PageWriter::write() {
    const TimeAxis axis(_report.spans().spans());
    writeHead();
    _out.raw("<body>\n<a class=\"skip\" href=\"#summary\">To the summary</a>\n<header><h1>");
    for (const ReportInput& input : _report.inputs())
        _out.raw(&input == &_report.inputs().front() ? "" : ", ").text(input.name);
    _out.raw("</h1>\n<nav aria-label=\"Parts of this page\"><ul>"
             "<li><a href=\"#summary\">Summary</a></li><li><a href=\"#charts\">Charts</a></li>"
             "");
    if (!_report.track().isEmpty())
        _out.raw("<li><a href=\"#track\">Track</a></li>");
    _out.raw("<li><a href=\"#events\">Events</a></li><li><a href=\"#cells\">Cells</a></li>"
             "<li><a href=\"#neighbours\">Neighbours</a></li><li><a href=\"#contexts\">Contexts</a></li>"
             "<li><a href=\"#statistics\">Statistics</a></li></ul></nav>\n"
             "<div id=\"tools\"></div></header>\n<main>\n");
    writeSummary(_out, _report);
    writePictures(_out, _report, axis);
    writeTrack(_out, _report);
    writeEvents(_out, _report);
    writeTables(_out, _report);
    writeStatistics(_out, _report);
    _out.raw("</main>\n<footer><p>Made by ").text(_report.options().generator);
    _out.raw(". A number after # is that of a message in its file, the record of <code>velmora-log decode "
             "--samples</code> and <code>events</code>. Times are those of arrival.</p></footer>\n");
    writeData(_out, _report, axis);
    _out.raw("<script>").raw(pageScript).raw("</script>\n</body>\n</html>\n");
    _out.flush();
}

} // namespace velmora
