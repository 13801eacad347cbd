#!/usr/bin/env python3
# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Scripts/check-includes, run on small trees."""

import contextlib
import io
import subprocess
import sys
import tempfile
import unittest
from importlib.machinery import SourceFileLoader
from importlib.util import module_from_spec, spec_from_loader
from pathlib import Path
from types import ModuleType

CHECK = Path(__file__).resolve().parents[2] / "Scripts" / "check-includes"


def load_check() -> ModuleType:
    """The script as a module, so that not every case starts a process."""
    sys.dont_write_bytecode = True
    spec = spec_from_loader("check_includes", SourceFileLoader("check_includes", str(CHECK)))
    assert spec and spec.loader
    module = module_from_spec(spec)
    sys.modules["check_includes"] = module  # which its dataclasses look for
    spec.loader.exec_module(module)
    return module


check_includes = load_check()


class IncludeCheckTest(unittest.TestCase):
    def run_on(self, files: dict[str, str], *options: str) -> tuple[int, list[str]]:
        """Exit status and lines for a tree of these files."""
        with tempfile.TemporaryDirectory() as folder:
            for name, text in files.items():
                path = Path(folder, name)
                path.parent.mkdir(parents=True, exist_ok=True)
                path.write_text(text, encoding="utf-8")
            with contextlib.redirect_stdout(io.StringIO()) as output:
                status = check_includes.main([*options, folder])
            return status, output.getvalue().splitlines()

    def expect_problem(self, path: str, include: str, reason: str) -> None:
        with self.subTest(path=path, include=include):
            status, lines = self.run_on({path: f"#pragma once\n\n#include {include}\n"})
            self.assertEqual(lines, [f"{path}:3: {reason}"])
            self.assertEqual(status, 1)

    def expect_none(self, path: str, include: str) -> None:
        with self.subTest(path=path, include=include):
            self.assertEqual(self.run_on({path: f"  #  include {include} // why\n"}), (0, []))

    def test_an_include_against_the_table_is_reported_with_its_line(self) -> None:
        self.expect_problem("PropertyLists/Value.h", '"LogGenerator/Base.h"',
                            "PropertyLists may not include LogGenerator")
        self.expect_problem("LogGenerator/LTE/BLER.cpp", '"Recording/MessageReader.h"',
                            "LogGenerator may not include Recording")
        self.expect_problem("Platform/Clock.h", '"Platform/Linux/MainLoop.h"',
                            "Platform may not include Platform/Linux")

    def test_an_include_down_the_table_is_fine(self) -> None:
        self.expect_none("LogGenerator/Base.h", '"LogMessages/Record.h"')
        self.expect_none("LogGenerator/Base.h", '"LogGenerator/LTE/LTEClassIndex.h"')
        self.expect_none("Platform/Linux/MainLoop.cpp", '"Platform/MainQueue.h"')
        self.expect_none("Platform/Clock.h", "<chrono>")

    def test_every_include_counts_even_after_a_good_one(self) -> None:
        text = '#include "Platform/Bytes.h"\n#include "Model/NodePath.h"\n#include "App/VelmoraApp.h"\n'
        self.assertEqual(
            self.run_on({"LogMessages/Record.h": text}),
            (1, ["LogMessages/Record.h:2: LogMessages may not include Model",
                 "LogMessages/Record.h:3: LogMessages may not include App"]),
        )

    def test_libraries_are_for_the_rooms_that_the_table_names(self) -> None:
        self.expect_none("PropertyLists/XMLReader.cpp", "<pugixml.hpp>")
        self.expect_problem("Model/Snapshot.cpp", "<pugixml.hpp>", "Model may not include pugixml")
        self.expect_none("Tools/CommandLine.cpp", "<CLI/CLI.hpp>")
        self.expect_problem("Platform/PrintableText.h", "<utf8proc.h>", "Platform may not include utf8proc")
        self.expect_problem("Tools/Text/JSONText.cpp", "<nlohmann/json.hpp>", "Tools may not include nlohmann_json")
        self.expect_problem("Model/Snapshot.cpp", "<boost/any.hpp>", "Model may not include <boost/any.hpp>")

    def test_qt_is_for_the_machine_the_service_and_the_toolkit(self) -> None:
        self.expect_none("Platform/Linux/MainLoop.cpp", "<QCoreApplication>")
        self.expect_none("Telephony/ModemManager/Bus.cpp", "<QDBusMessage>")
        for path in ("App/VelmoraCell.cpp", "Tools/Report.cpp", "Recording/MessageReader.cpp", "Platform/Clock.h"):
            room = path.split("/")[0]
            self.expect_problem(path, "<QString>", f"{room} may not include Qt")
        self.expect_problem("App/main.cpp", "<QtCore/QString>", "App may not include Qt")

    def test_the_toolkits_headers_show_neither_qt_nor_widgets(self) -> None:
        self.expect_none("Toolkit/Button.cpp", "<QPushButton>")
        self.expect_problem("Toolkit/Button.h", "<QPushButton>", "Toolkit may not include Qt")
        self.expect_none("Toolkit/Button.cpp", '"Toolkit/Widgets/Conversions.h"')
        self.expect_problem("Toolkit/Button.h", '"Toolkit/Widgets/Conversions.h"',
                            "Toolkit may not include Toolkit/Widgets")
        self.expect_none("Toolkit/Widgets/Animation.h", "<QObject>")

    def test_the_operating_systems_headers_are_kept_out_of_the_interfaces(self) -> None:
        self.expect_none("Platform/Linux/Files/Files.cpp", "<sys/stat.h>")
        self.expect_problem("Platform/FileSystem.h", "<fcntl.h>", "Platform may not include system")
        self.expect_problem("Model/Snapshot.cpp", "<unistd.h>", "Model may not include system")

    def test_a_programs_joint_alone_sees_the_machine(self) -> None:
        self.expect_none("App/main.cpp", '"Platform/Linux/ProgramLog.h"')
        self.expect_none("App/LinuxAppPlatform.h", '"Platform/Linux/QtMainQueue.h"')
        self.expect_none("Telephony/main.cpp", "<CLI/CLI.hpp>")
        self.expect_none("App/main.cpp", '"App/LinuxAppPlatform.h"')
        self.expect_problem("App/SelfTest.cpp", '"Platform/Linux/ProgramLog.h"', "App may not include Platform/Linux")
        self.expect_problem("App/SelfTest.cpp", '"App/LinuxAppPlatform.h"',
                            "App/LinuxAppPlatform.h is for App/main.cpp alone")
        self.expect_problem("Telephony/Service/LogServer.cpp", '"Platform/Linux/MainLoop.h"',
                            "Telephony may not include Platform/Linux")

    def test_includes_are_written_from_the_root(self) -> None:
        self.expect_problem("Model/NodePath.cpp", '"NodePath.h"',
                            "NodePath.h lies in no room; includes are written from the root of the tree")
        self.expect_problem("Model/NodePath.cpp", '"Tests/Support/Hex.h"',
                            "Tests/Support/Hex.h lies in no room; includes are written from the root of the tree")
        self.expect_none("Telephony/ModemManager/Bus.cpp", '"Bus.moc"')

    def test_a_folder_that_is_no_room_is_reported(self) -> None:
        self.assertEqual(
            self.run_on({"Charts/Axis.h": "#pragma once\n"}),
            (1, ["Charts/Axis.h:1: Charts is no room; the table is in Scripts/check-includes"]),
        )

    def test_tests_benchmarks_and_fuzzers_may_include_everything(self) -> None:
        for path in ("Tests/App/CellTest.cpp", "Benchmarks/Floor.cpp", "Fuzz/Targets.cpp", "build/moc.cpp"):
            self.expect_none(path, '"App/LinuxAppPlatform.h"')

    def test_a_library_links_what_its_sources_may_include(self) -> None:
        machine = "velmora_library(velmora_platform_linux SOURCES A.cpp LINK velmora_platform Qt6::Core)\n"
        up = "\nvelmora_library(velmora_platform SOURCES\n    B.cpp\n    LINK velmora_platform_linux)\n"
        down = "velmora_library(velmora_platform SOURCES B.cpp)\n"
        self.assertEqual(
            self.run_on({"Platform/CMakeLists.txt": up, "Platform/Linux/CMakeLists.txt": machine}),
            (1, ["Platform/CMakeLists.txt:2: velmora_platform may not link velmora_platform_linux"]),
        )
        self.assertEqual(
            self.run_on({"Platform/CMakeLists.txt": down, "Platform/Linux/CMakeLists.txt": machine}), (0, [])
        )

    def test_a_link_list_written_apart_counts_too(self) -> None:
        self.assertEqual(
            self.run_on({
                "Model/CMakeLists.txt": "velmora_library(velmora_model SOURCES A.cpp)\n",
                "PropertyLists/CMakeLists.txt": "velmora_library(velmora_property_lists SOURCES B.cpp)\n"
                                                "target_link_libraries(velmora_property_lists PRIVATE velmora_model)\n",
            }),
            (1, ["PropertyLists/CMakeLists.txt:2: velmora_property_lists may not link velmora_model"]),
        )

    def test_the_matrix_counts_what_each_room_includes(self) -> None:
        files = {
            "Model/A.h": '#include "Platform/Clock.h"\n#include "Model/B.h"\n',
            "Model/B.h": '#include "Platform/Clock.h"\n#include "LogGenerator/Base.h"\n',
        }
        status, lines = self.run_on(files, "--matrix")
        self.assertEqual([line.split() for line in lines], [["Model", "LogGenerator", "1"], ["Model", "Platform", "2"]])
        self.assertEqual(status, 0)

    def test_the_script_itself_ends_with_that_status(self) -> None:
        with tempfile.TemporaryDirectory() as folder:
            Path(folder, "Model").mkdir()
            Path(folder, "Model", "A.h").write_text('#include "App/VelmoraApp.h"\n', encoding="utf-8")
            run = subprocess.run([CHECK, folder], capture_output=True, text=True, check=False)
        self.assertEqual((run.returncode, run.stdout), (1, "Model/A.h:1: Model may not include App\n"))

    def test_an_unknown_option_is_a_usage_error(self) -> None:
        run = subprocess.run([CHECK, "--verbose"], capture_output=True, text=True, check=False)
        self.assertEqual((run.returncode, run.stdout), (2, ""))
        self.assertEqual(run.stderr, "usage: check-includes [--matrix] [DIRECTORY]\n")


if __name__ == "__main__":
    unittest.main()
