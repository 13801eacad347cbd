# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the sandbox, with scripts in place of Velmora's programs."""

import os
import stat
import tempfile
import unittest
from pathlib import Path
from unittest import mock

from velmora_chaos.checks import wait_for
from velmora_chaos.sandbox import SOURCE, Sandbox

SERVICE = """#!/bin/sh
echo "$$ $*" >"$VELMORA_PORT_DIR/started"
echo "serving here" >&2
exec sleep 60
"""


def is_running(pid: int) -> bool:
    try:
        os.kill(pid, 0)
    except ProcessLookupError:
        return False
    return True


class SandboxTest(unittest.TestCase):
    def setUp(self) -> None:
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.directory = Path(temporary.name)

    def test_ports_are_private(self) -> None:
        with Sandbox(self.directory, self.directory / "own") as sandbox:
            mode = stat.S_IMODE(sandbox.port().parent.stat().st_mode)
        self.assertEqual(mode, 0o700)

    def test_the_environment_of_the_caller_does_not_reach_the_programs(self) -> None:
        caller = {"VELMORA_SYSROOT": "/elsewhere", "VELMORA_PORT_DIR": "/elsewhere", "LANG": "C"}
        with mock.patch.dict(os.environ, caller), Sandbox(self.directory, self.directory) as sandbox:
            self.assertNotIn("VELMORA_SYSROOT", sandbox.environment)
            self.assertEqual(sandbox.environment["VELMORA_PORT_DIR"], str(self.directory / "ports"))
            self.assertEqual(sandbox.environment["LANG"], "C")

    def test_resources_are_the_source_tree_s(self) -> None:
        self.assertTrue((SOURCE / "Resources" / "CMakeLists.txt").is_file())

    def test_service_returns_once_it_serves_and_is_killed_at_the_end(self) -> None:
        program = self.directory / "velmora-telephonyd"
        program.write_text(SERVICE)
        program.chmod(0o700)
        with Sandbox(self.directory, self.directory) as sandbox:
            service = sandbox.service("scenario:gsm")
            pid, *arguments = sandbox.port("started").read_text().split()
            self.assertEqual(arguments, ["--source", "scenario:gsm", "--log-level", "5"])
            self.assertEqual(service.lines.count("serving "), 1)
            self.assertTrue(is_running(int(pid)))
        wait_for("the end of the service", lambda: not is_running(int(pid)), 10)

    def test_ports_lists_the_sockets_that_match(self) -> None:
        with Sandbox(self.directory, self.directory) as sandbox:
            for name in ("server", "server.channel.1"):
                sandbox.port(name).touch()
            self.assertEqual(sandbox.ports("*.channel.*"), [sandbox.port("server.channel.1")])
            self.assertEqual(len(sandbox.ports()), 2)
