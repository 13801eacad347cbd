// SPDX-FileCopyrightText: 2026 Velmora contributors
// SPDX-License-Identifier: MIT

#include "Tests/Platform/LinuxPortFixture.h"

#include <gmock/gmock.h>
#include <sys/stat.h>

#include <cstdlib>
#include <fstream>

namespace velmora {

namespace {

using testing::ElementsAre;
using testing::IsEmpty;

/// Sets a variable of the environment, or removes it, and puts the earlier state back.
class Variable {
public:
    Variable(const char* name, const char* value) : _name(name) {
        if (const char* earlier = std::getenv(name))
            _earlier = earlier;
        set(value);
    }
    ~Variable() { set(_earlier ? _earlier->c_str() : nullptr); }
    Variable(const Variable&) = delete;
    Variable& operator=(const Variable&) = delete;

private:
    void set(const char* value) {
        if (value)
            ::setenv(_name, value, 1);
        else
            ::unsetenv(_name);
    }
    const char* _name;
    std::optional<std::string> _earlier;
};

constexpr auto noAnswer = [](LocalPort&, std::int32_t, const Data&) -> std::optional<Data> {
    return std::nullopt;
};

TEST_F(LinuxPortTest, APortRemovesItsFiles) {
    auto port = listening("one");
    EXPECT_THAT(files(), ElementsAre("one", "one.lock"));
    port->invalidate();
    EXPECT_THAT(files(), IsEmpty());
    port = listening("one");
    EXPECT_THAT(files(), ElementsAre("one", "one.lock"));
    port.reset();
    EXPECT_THAT(files(), IsEmpty());
}

TEST_F(LinuxPortTest, ATakenNameGivesAHandleThatLeavesTheOwnerAlone) {
    const auto owner = listening("one");
    auto second = LinuxMessagePorts(_options).createLocal("one", noAnswer);
    EXPECT_TRUE(second.alreadyExisted);
    ASSERT_TRUE(second.port);
    EXPECT_FALSE(second.port->isValid());
    EXPECT_EQ(second.port->name(), "one");
    second.port->attachToMainQueue();
    second.port->setInvalidationCallback([](LocalPort&) { ADD_FAILURE() << "it never was valid"; });
    second.port->invalidate();
    second.port.reset();

    EXPECT_THAT(files(), ElementsAre("one", "one.lock"));
    sendAll(rawClient("one"), hex("00 00 00 00  01 00 00 00  04 00 00 00  00 00 00 00"));
    ASSERT_TRUE(eventually([&] { return !_messages.empty(); }));
    EXPECT_THAT(_log.lines(), IsEmpty());
}

TEST_F(LinuxPortTest, AFailureIsThatOfTheLatestCall) {
    LinuxMessagePorts ports(_options);
    EXPECT_EQ(ports.failure(), "");
    EXPECT_EQ(ports.createLocal("a/b", noAnswer).port, nullptr);
    EXPECT_EQ(ports.failure(), "port name \"a/b\" holds a '/' or NUL");
    // That there is no such port is no failure.
    EXPECT_EQ(ports.createRemote("none"), nullptr);
    EXPECT_EQ(ports.failure(), "");
    EXPECT_EQ(ports.createRemote(""), nullptr);
    EXPECT_EQ(ports.failure(), "an empty port name");
    const auto owner = ports.createLocal("one", noAnswer);
    EXPECT_EQ(ports.failure(), "");
    _log.clear();
}

TEST_F(LinuxPortTest, ALostLockFileIsNotTheNextOwnersLoss) {
    auto first = listening("one");
    std::filesystem::remove(path("one.lock"));
    const auto second = listening("one");
    first.reset();
    EXPECT_THAT(files(), ElementsAre("one", "one.lock"));
    sendAll(rawClient("one"), hex("00 00 00 00  01 00 00 00  04 00 00 00  00 00 00 00"));
    ASSERT_TRUE(eventually([&] { return !_messages.empty(); }));
}

TEST_F(LinuxPortTest, AFileThatIsNoSocketIsNotRemoved) {
    std::ofstream(path("one")) << "precious";
    const auto created = LinuxMessagePorts(_options).createLocal("one", noAnswer);
    EXPECT_FALSE(created.port);
    EXPECT_FALSE(created.alreadyExisted);
    EXPECT_THAT(files(), ElementsAre("one"));
    EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{3, "Message port one: " + path("one") +
                                                                   " is there and no socket"}));
}

TEST_F(LinuxPortTest, NamesThatCannotBeAreRefused) {
    const std::string longName(81, 'n');
    const std::pair<std::string, std::string> cases[] = {
        {"", "an empty port name"},
        {".hidden", "port name \".hidden\" begins with '.'"},
        {"..", "port name \"..\" begins with '.'"},
        {"a/b", "port name \"a/b\" holds a '/' or NUL"},
        {"a.lock", "port name \"a.lock\" ends in \".lock\""},
        {longName, "port name \"" + longName + "\" of 81 bytes, wanted at most 80"},
    };
    for (const auto& [name, reason] : cases) {
        SCOPED_TRACE(name);
        _log.clear();
        EXPECT_FALSE(LinuxMessagePorts(_options).createLocal(name, noAnswer).port);
        EXPECT_FALSE(LinuxMessagePorts(_options).createRemote(name));
        const CapturedLog::Line line{3, "Message port " + name + ": " + reason};
        EXPECT_THAT(_log.lines(), ElementsAre(line, line));
    }
    EXPECT_THAT(files(), IsEmpty());
}

TEST_F(LinuxPortTest, LongDirectoriesAndLongNamesWork) {
    _options.directory = _directory / std::string(120, 'd') / std::string(120, 'e');
    const std::string name(80, 'n');
    const auto port = listening(name);
    EXPECT_TRUE(std::filesystem::is_socket(*_options.directory / name));
    const auto remote = LinuxMessagePorts(_options).createRemote(name);
    ASSERT_TRUE(remote);
    remote->post(4, dataOf("far"));
    ASSERT_TRUE(eventually([&] { return !_messages.empty(); }));
    EXPECT_THAT(_messages, ElementsAre(Message{4, "far"}));
    port->invalidate();
    EXPECT_TRUE(std::filesystem::is_empty(*_options.directory));
}

TEST_F(LinuxPortTest, TheEnvironmentNamesTheDirectory) {
    const std::string own = path("own");
    const std::string runtime = path("runtime");
    const Variable noOwn("VELMORA_PORT_DIR", nullptr);
    const Variable xdg("XDG_RUNTIME_DIR", runtime.c_str());
    {
        const auto port = LinuxMessagePorts().createLocal("one", noAnswer).port;
        EXPECT_TRUE(std::filesystem::is_socket(runtime + "/velmora/one"));
        EXPECT_EQ(std::filesystem::status(runtime + "/velmora").permissions(),
                  std::filesystem::perms::owner_all);
    }
    {
        const Variable set("VELMORA_PORT_DIR", own.c_str());
        const auto port = LinuxMessagePorts().createLocal("one", noAnswer).port;
        EXPECT_TRUE(std::filesystem::is_socket(own + "/one"));
    }
    {
        const Variable set("XDG_RUNTIME_DIR", "relative");
        const auto directory = PortDirectory::openStandard();
        ASSERT_TRUE(directory) << directory.reason();
        EXPECT_EQ(directory->path(), "/tmp/velmora-" + std::to_string(::geteuid()));
        std::error_code ignored;
        std::filesystem::remove(directory->path(), ignored); // stays when it is in use
    }
}

TEST_F(LinuxPortTest, UnusableDirectoriesAreRefusedWithAReason) {
    std::ofstream(path("file")) << "x";
    std::filesystem::create_directory(path("open"));
    std::filesystem::permissions(path("open"), std::filesystem::perms(0777));
    std::filesystem::create_directory(path("real"));
    std::filesystem::create_directory_symlink(path("real"), path("link"));
    const std::pair<std::string, std::string> cases[] = {
        {path("file"), "port directory " + path("file") + " cannot be opened: Not a directory"},
        {path("file") + "/in", "port directory " + path("file") + "/in cannot be made: Not a directory"},
        {path("open"), "port directory " + path("open") + " has mode 0777, wanted 0700"},
        {path("link"), "port directory " + path("link") + " cannot be opened: Not a directory"},
    };
    for (const auto& [directory, reason] : cases) {
        SCOPED_TRACE(directory);
        _log.clear();
        _options.directory = directory;
        EXPECT_FALSE(LinuxMessagePorts(_options).createLocal("one", noAnswer).port);
        EXPECT_THAT(_log.lines(), ElementsAre(CapturedLog::Line{3, "Message port one: " + reason}));
    }
}

TEST_F(LinuxPortTest, ADirectoryOfAnotherUserIsRefused) {
    if (::geteuid() != 0)
        GTEST_SKIP() << "only root can give a directory away";
    ASSERT_EQ(::mkdir(path("given").c_str(), 0700), 0);
    ASSERT_EQ(::chown(path("given").c_str(), 12345, 0), 0);
    const auto directory = PortDirectory::open(path("given"), S_IWGRP | S_IWOTH);
    ASSERT_FALSE(directory);
    EXPECT_EQ(directory.reason(),
              "port directory " + path("given") + " belongs to user 12345, wanted user 0");
}

} // namespace

} // namespace velmora
