// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

/// The tables, indexes and views of RecordingDatabase. Documentation/database.md describes them; a change to
/// a name or a meaning raises `user_version`.
namespace velmora::databaseLayout {

extern const char* const tables;
extern const char* const indexes;
extern const char* const views;

} // namespace velmora::databaseLayout
