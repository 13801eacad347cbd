// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Toolkit/Folder.h"

#include "Toolkit/Widgets/Conversions.h"

#include <QDesktopServices>
#include <QUrl>

namespace velmora {

bool openFolder(std::string_view path) {
    return QDesktopServices::openUrl(QUrl::fromLocalFile(toQt(path)));
}

bool openPage(std::string_view path) {
    return openFolder(path); // the desktop knows what each file is opened with
}

} // namespace velmora
