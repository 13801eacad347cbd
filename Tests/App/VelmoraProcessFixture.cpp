// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/App/VelmoraProcessFixture.h"

namespace velmora {

std::unique_ptr<QProcess> VelmoraProcessTest::start(const char* program, const QStringList& arguments,
                                                    const char* name) {
    auto process = std::make_unique<QProcess>();
    process->setProcessEnvironment(environment);
    process->setStandardOutputFile(path(name ? name : program) + ".out");
    process->setStandardErrorFile(path(name ? name : program) + ".err");
    process->start(QString(VELMORA_BUILD_DIR "/") + program, arguments);
    EXPECT_TRUE(process->waitForStarted());
    return process;
}

} // namespace velmora
