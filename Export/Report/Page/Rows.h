// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Analysis/MessageReport.h"
#include "Export/Report/MessageRange.h"
#include "Platform/Clock.h"

#include <initializer_list>
#include <string_view>

namespace velmora {

class DriveReport;
class Markup;

/// Parts that several tables of the page have.

/// `<table>` with its caption and a heading for each column; those that begin with "#" are of numbers.
void beginTable(Markup& out, std::string_view caption, std::initializer_list<std::string_view> columns);
void endTable(Markup& out);
void writeCell(Markup& out, std::string_view text);
void writeNumberCell(Markup& out, std::string_view text);
/// The message's number, which the page's script turns into the place in the charts.
void writeMessage(Markup& out, const DriveReport& report, MessageNumber message);
/// A cell with the first and the last message; empty where they are not known.
void writeRange(Markup& out, const DriveReport& report, const MessageRange& messages);
void writeTime(Markup& out, Time time);

} // namespace velmora
