# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
# A script: makes the source that has the report page's script and style. The script's files are joined in their order.
#   cmake -DOUTPUT=file.cpp -DSTYLE=file.css "-DSCRIPTS=a.js;b.js" -P EmbedPage.cmake

function(page_literal variable content)
    # A compiler need not take longer literals than 64 KiB.
    set(literal)
    string(LENGTH "${content}" length)
    set(begin 0)
    while(begin LESS length)
        string(SUBSTRING "${content}" ${begin} 8000 piece)
        string(APPEND literal "\n    R\"velmora(${piece})velmora\"")
        math(EXPR begin "${begin} + 8000")
    endwhile()
    if(NOT literal)
        set(literal " \"\"")
    endif()
    set(${variable} "${literal}" PARENT_SCOPE)
endfunction()

file(READ ${STYLE} style)
set(script "(() => {\n\"use strict\";\n")
foreach(path IN LISTS SCRIPTS)
    file(READ ${path} part)
    string(APPEND script "${part}")
endforeach()
string(APPEND script "})();\n")

page_literal(style_literal "${style}")
page_literal(script_literal "${script}")
file(WRITE ${OUTPUT} "// Generated from Resources/report; changes are lost.
#include \"Export/Report/Page/PageFiles.h\"

namespace velmora {

constexpr std::string_view pageScript =${script_literal};

constexpr std::string_view pageStyle =${style_literal};

} // namespace velmora
")
