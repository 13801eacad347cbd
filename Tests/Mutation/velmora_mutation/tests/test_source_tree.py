# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tests of how files and technologies are found."""

import tempfile
import unittest
from pathlib import Path

from velmora_mutation.source_tree import decoder_files, is_within, technologies, technology_of

FILES = [
    "LogGenerator/LogGenerator.h",
    "LogGenerator/OstrelLogGenerator.h",
    "LogGenerator/Fields/Field.cpp",
    "LogGenerator/C2K/C2KLogGenerator.h",
    "LogGenerator/C2K/EVDO/EVDOStatus.cpp",
    "LogGenerator/OstrelGSM/Registration/Ostrel_GSMLogGenerator.h",
    "LogMessages/Record.h",
    "LogMessages/ListLogGenerator.h",
]


class DecoderFilesTest(unittest.TestCase):
    def test_finds_sources_and_headers_at_any_depth(self) -> None:
        with tempfile.TemporaryDirectory() as directory:
            for name in (
                *FILES,
                "LogGenerator/CMakeLists.txt",
                "Platform/Value.h",
                "Tests/LogGenerator/A.cpp",
            ):
                path = Path(directory, name)
                path.parent.mkdir(parents=True, exist_ok=True)
                path.write_text(f"// {name}\n")
            found = decoder_files(Path(directory))
        self.assertEqual(sorted(found), sorted(FILES))
        self.assertEqual(found["LogMessages/Record.h"], "// LogMessages/Record.h\n")


class TechnologiesTest(unittest.TestCase):
    KNOWN = technologies(FILES)

    def test_are_the_folders_with_a_generator(self) -> None:
        self.assertEqual(self.KNOWN, {"C2K", "OstrelGSM"})

    def test_of_a_source_or_a_test_at_any_depth(self) -> None:
        for path, technology in {
            "LogGenerator/C2K/EVDO/EVDOStatus.cpp": "C2K",
            "LogGenerator/OstrelGSM/GSM/GSMSet.h": "OstrelGSM",
            "Tests/LogGenerator/C2K/OneX/A.cpp": "C2K",
            "LogGenerator/Fields/Field.cpp": None,
            "LogGenerator/Base.h": None,
            "LogMessages/Record.h": None,
            "Tests/LogGenerator/BaseTest.cpp": None,
            "Telephony/C2K/Drive.cpp": None,
        }.items():
            with self.subTest(path=path):
                self.assertEqual(technology_of(path, self.KNOWN), technology)


class IsWithinTest(unittest.TestCase):
    def test_a_folder_whose_name_begins_alike_is_another(self) -> None:
        self.assertTrue(is_within("LogGenerator/Fields/A.h", ["LogGenerator"]))
        self.assertFalse(is_within("LogGeneratorTools/A.h", ["LogGenerator"]))
