// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#pragma once

#include "Tests/Support/TemporaryDirectory.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

#include <QElapsedTimer>
#include <QFile>
#include <QProcess>
#include <QThread>

#include <csignal>
#include <filesystem>
#include <functional>
#include <memory>
#include <string>

namespace velmora {

/// The built program beside a built service, over real sockets in a directory of the test's.
class VelmoraProcessTest : public testing::Test {
protected:
    static constexpr int patience_ms = 40'000;

    VelmoraProcessTest() {
        environment.insert("VELMORA_PORT_DIR", path("ports"));
        environment.insert("XDG_STATE_HOME", path("state"));
        environment.insert("XDG_CONFIG_HOME", path("config"));
        environment.remove("VELMORA_SYSROOT");
        environment.remove("VELMORA_LOG_DIRECTORY");
        environment.remove("VELMORA_SOURCE");
    }
    ~VelmoraProcessTest() override {
        if (startedService > 0)
            ::kill(startedService, SIGKILL);
    }

    /// Its output goes to the files NAME.out and NAME.err, after the program unless another name is given.
    std::unique_ptr<QProcess> start(const char* program, const QStringList& arguments,
                                    const char* name = nullptr);
    std::unique_ptr<QProcess> startService(const char* scenario = "gsm") {
        auto service = start("velmora-telephonyd", {"--source", QString("scenario:%1,seed=1").arg(scenario)});
        EXPECT_TRUE(eventually([&] { return exists("ports/com.velmora.vox.server"); }));
        return service;
    }
    [[nodiscard]] QString path(const char* name) const {
        return QString::fromStdString((directory / name).string());
    }
    [[nodiscard]] bool exists(const char* name) const { return std::filesystem::exists(directory / name); }
    [[nodiscard]] std::string text(const char* name) const {
        QFile file(path(name));
        return file.open(QIODevice::ReadOnly) ? file.readAll().toStdString() : "";
    }
    void put(const char* name, const QByteArray& content) const {
        const auto place = directory / name;
        std::filesystem::create_directories(place.parent_path());
        QFile file(path(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly));
        ASSERT_EQ(file.write(content), content.size());
        file.close();
        ASSERT_TRUE(file.setPermissions(QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    }
    static bool eventually(const std::function<bool()>& condition) {
        QElapsedTimer waited;
        waited.start();
        while (!condition()) {
            if (waited.elapsed() > patience_ms)
                return false;
            QThread::msleep(10);
        }
        return true;
    }
    static int exitStatus(QProcess& process) {
        if (!process.waitForFinished(patience_ms))
            return -1;
        return process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -2;
    }
    static void end(QProcess& process) {
        ::kill(static_cast<pid_t>(process.processId()), SIGTERM);
        EXPECT_EQ(exitStatus(process), 0);
    }

    TemporaryDirectory directory;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    /// A service that the program has started, to be ended with the test.
    pid_t startedService = 0;
};

} // namespace velmora
