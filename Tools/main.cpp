// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tools/VelmoraLog.h"

int main(int count, char** arguments) {
    return velmora::runVelmoraLog(count, arguments);
}
