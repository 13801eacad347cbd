# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of the copy of the source tree."""

import os
import subprocess
import tempfile
import unittest
from pathlib import Path

from velmora_mutation.workspace import copy_tree


class CopyTreeTest(unittest.TestCase):
    def setUp(self) -> None:
        temporary = tempfile.TemporaryDirectory()
        self.addCleanup(temporary.cleanup)
        self.source = Path(temporary.name, "source")
        self.tree = Path(temporary.name, "tree")
        self.tree.mkdir()
        self.write("LogGenerator/Base.cpp", "base\n")
        self.write("test", "#!/bin/sh\n")
        (self.source / "test").chmod(0o755)
        self.write(".gitignore", "/build/\n")
        self.write("build/out.o", "object\n")
        subprocess.run(["git", "init", "--quiet", self.source], check=True)

    def write(self, name: str, text: str) -> None:
        path = self.source / name
        path.parent.mkdir(parents=True, exist_ok=True)
        path.write_text(text)

    def copied(self) -> dict[str, str]:
        copy_tree(self.source, self.tree)
        files = [path for path in self.tree.rglob("*") if path.is_file()]
        return {path.relative_to(self.tree).as_posix(): path.read_text() for path in files}

    def test_copies_what_git_does_not_ignore(self) -> None:
        self.assertEqual(
            self.copied(),
            {"LogGenerator/Base.cpp": "base\n", "test": "#!/bin/sh\n", ".gitignore": "/build/\n"},
        )
        self.assertTrue(os.access(self.tree / "test", os.X_OK))

    def test_a_file_that_is_the_same_stays_untouched(self) -> None:
        self.copied()
        base = self.tree / "LogGenerator" / "Base.cpp"
        os.utime(base, (1, 1))
        os.utime(self.tree / "test", (1, 1))
        self.write("test", "#!/bin/bash\n")
        self.assertEqual(self.copied()["test"], "#!/bin/bash\n")
        self.assertEqual(base.stat().st_mtime, 1)
        self.assertGreater((self.tree / "test").stat().st_mtime, 1)

    def test_a_file_that_was_moved_leaves_nothing(self) -> None:
        self.copied()
        self.write("LogGenerator/Fields/Base.cpp", "base\n")
        (self.source / "LogGenerator" / "Base.cpp").unlink()
        self.assertEqual(set(self.copied()), {"LogGenerator/Fields/Base.cpp", "test", ".gitignore"})
