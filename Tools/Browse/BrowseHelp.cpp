// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/Browse/BrowseHelp.h"

namespace velmora {

std::vector<std::string> browseHelp() {
    return {
        " arrows, j k, PgUp PgDn, Space b, Home End, g G   move in the part in [brackets]",
        " Tab, Shift-Tab   the next or previous part: messages, display, bytes, events",
        " t      go to a time: 05:02:40, +90 or -90 seconds, a date",
        " /      search names, paths, values and notes;  n  again,  N  backwards",
        " f      list only messages after which a condition holds, or of some codes:",
        "        serving.level < -110 dBm    0x5134, 0x5137",
        " e E    the next or previous event",
        " ] [    the next or previous section of the display",
        " m      write a note on the message; an empty one removes it",
        " v      begin a range that ends with the chosen message; again: no range",
        " w      write the range, or all, with the notes, to a new recording",
        " y      copy the row, the value or the bytes to the terminal's clipboard",
        " > <    the next or previous file,  T  the next technology of the file",
        " Ctrl-L draw again,  Ctrl-Z  stop the program,  q  quit",
        "",
        " > chosen   * changed by this message   = reported by it unchanged   | in the range",
        " In the strip: ^ where the message lies, ! events that matter",
        "",
        " Any key goes back.",
    };
}

} // namespace velmora
