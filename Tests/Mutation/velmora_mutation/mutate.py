# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""Tries the tests of the decoders: changes one operator, number or statement of LogGenerator/ at a time and looks
whether a test notices.

usage: mutate [--sample N] [--seed N] [--jobs N] [--directory DIR] [--again OUTPUT] [FILE[:LINE]...]

Of all changes a sample is taken, the same for the same seed, in equal shares from the technologies and from what
they share; with files or lines named, from those alone; --sample 0 takes all. The tree stays as it is: a copy is
built in the directory (build/mutate), and a changed file is compiled beside it and linked in front of the library
that has the unchanged one.

A change is noticed when a test fails, crashes or does not come to an end. One that does not compile (a table may
check itself) is told and does not count. One that survives must stand in mutations-equivalent with the reason why no
test can tell; for any other the exit status is 1.
"""

import argparse
import itertools
import json
import os
import random
import re
import resource
import shlex
import shutil
import signal
import subprocess
import sys
import threading
import time
from concurrent.futures import ThreadPoolExecutor

SOURCE = os.path.abspath(os.path.join(os.path.dirname(__file__), "..", "..", ".."))
EQUIVALENT = os.path.join(SOURCE, "Tests", "Mutation", "mutations-equivalent")
SHARED = "test-log-generator"
PROGRAMS = {"C2K": "test-c2k", "LTE": "test-lte", "OstrelGSM": "test-ostrel-gsm", "UTRAN": "test-utran"}
WIDE = 20  # a header that more files than these include is tried with one technology after the other
WIDE_SHARE = 20  # such headers take long: one in so many of the sample at most
MEMORY = 4 << 30
# What most decoders include of that which is not changed, compiled once.
COMMON = [f"<{name}>" for name in ("algorithm", "charconv", "cmath", "functional", "map", "optional")]
COMMON += [f'"Platform/{name}.h"' for name in ("PropertyList", "SystemLog", "Value")]

TOKEN = re.compile(
    r"""(?P<skip>//[^\n]*|/\*.*?\*/|^[ \t]*\#(?:\\\n|[^\n])*|"(?:\\.|[^"\\])*"|'(?:\\.|[^'\\])+'|\s+)
      |(?P<number>\.?\d(?:[eEpP][+-]|'(?=\w)|[\w.])*)
      |(?P<word>[A-Za-z_]\w*)
      |(?P<sign><=>|<<=|>>=|->|::|[-+*/%&|^=!<>]=|&&|\|\||\+\+|--|<<|>>|[^\w\s])""",
    re.MULTILINE | re.DOTALL | re.VERBOSE,
)
# Binary ones stand between blanks; those of templates, references and pointers do not.
SIGNS = {
    "<": ["<=", ">="], "<=": ["<", ">"], ">": [">=", "<="], ">=": [">", "<"], "==": ["!="], "!=": ["=="],
    "&&": ["||"], "||": ["&&"], "+": ["-"], "-": ["+"], "*": ["/"], "/": ["*"], "%": ["/"],
    "&": ["|"], "|": ["&"], "<<": [">>"], ">>": ["<<"], "+=": ["-="], "-=": ["+="],
}
WORDS = {"true": "false", "false": "true"}


class Change:
    """One change of one file, `path` being relative to the source."""

    def __init__(self, path, source, start, end, text):
        self.path = path
        self.changed = source[:start] + text + source[end:]
        self.line = source.count("\n", 0, start) + 1
        first = source.rfind("\n", 0, start) + 1
        if text == "{}" and source[first:start].isspace():  # the line before tells which statement it is
            first = source.rfind("\n", 0, first - 1) + 1
        last = source.find("\n", end)
        self.before = " ".join(source[first:last].split())
        self.after = " ".join((source[first:start] + text + source[end:last]).split())

    def __str__(self):
        return f"{self.path}:{self.line}\n    - {self.before}\n    + {self.after}"

    def key(self):
        return self.path, self.before, self.after

    def group(self):
        folders = self.path.split("/")
        return folders[1] if len(folders) > 2 else "shared"


def other_numbers(text):
    """One more and one less; of a real number one more."""
    whole = re.fullmatch(r"(0[xX])?([0-9a-fA-F']+?)([uUlLzZ]*)", text)
    if not whole or (not whole[1] and not whole[2].replace("'", "").isdigit()):
        real = re.fullmatch(r"(\d+)(\.\d*f?)", text)
        return [f"{int(real[1]) + 1}{real[2]}"] if real else []
    value = int(whole[2].replace("'", ""), 16 if whole[1] else 10)
    numbers = [value + 1] + ([value - 1] if value > 0 else [])
    return [(f"0x{number:X}" if whole[1] else str(number)) + whole[3] for number in numbers]


def behind_call(tokens, i):
    """The index behind a statement at `i` that is nothing but a call, or None."""
    while i + 1 < len(tokens) and tokens[i].lastgroup == "word" and tokens[i + 1][0] in (".", "->", "::"):
        i += 2
    if i + 1 >= len(tokens) or tokens[i].lastgroup != "word" or tokens[i + 1][0] != "(":
        return None
    depth = 0
    for j in range(i + 1, len(tokens) - 1):
        depth += {"(": 1, ")": -1}.get(tokens[j][0], 0)
        if depth == 0:
            return j + 2 if tokens[j + 1][0] == ";" else None
    return None


def changes_of(path, source):
    """Every change of a file that makes sense, in order."""
    tokens = [token for token in TOKEN.finditer(source) if token.lastgroup != "skip"]
    checked_until = 0  # what a static_assert asks is no decoder
    for i, token in enumerate(tokens):
        text = token[0]
        if text == "static_assert":
            checked_until = source.index(";", token.end())
        if token.start() < checked_until:
            continue
        spaced = source[token.start() - 1].isspace() and source[token.end() : token.end() + 1].isspace()
        if token.lastgroup == "number":
            others = other_numbers(text)
        elif text in SIGNS and spaced and tokens[i - 1][0] not in ("operator", "template"):
            others = SIGNS[text]
        elif text == "!":
            others = [""]
        else:
            others = [WORDS[text]] if text in WORDS else []
        for other in others:
            yield Change(path, source, token.start(), token.end(), other)
        if token.lastgroup == "word" and tokens[i - 1][0] in (";", "{", "}", ")", ":", "else"):
            plain = text in ("return", "continue", "break") and tokens[i + 1][0] == ";"
            end = i + 2 if plain else behind_call(tokens, i)
            if end:
                yield Change(path, source, token.start(), tokens[end - 1].end(), "{}")


def read(path):
    with open(path, encoding="utf-8") as file:
        return file.read()


def write(path, text):
    os.makedirs(os.path.dirname(path), exist_ok=True)
    with open(path, "w", encoding="utf-8") as file:
        file.write(text)


def lines_of(*command, **options):
    return subprocess.run(command, check=True, stdout=subprocess.PIPE, text=True, **options).stdout.splitlines()


def equivalents():
    """The changes that no test can tell, by Change.key()."""
    known = set()
    text = re.sub(r"(?m)^#.*\n", "", read(EQUIVALENT)).strip()
    for block in re.split(r"\n\s*\n", text) if text else []:
        rows = re.fullmatch(r"file: (.+)\nfrom: (.+)\nto:( .*)\nwhy: (?s:.+)", block)
        if not rows:
            sys.exit(f"{EQUIVALENT}: not the rows file, from, to and why:\n{block}")
        known.add((rows[1], rows[2], rows[3].strip()))
    return known


def survivors(output):
    """The changes that survived in an earlier run, by Change.key()."""
    return set(re.findall(r"(?m)^survived (.+):\d+\n    - (.*)\n    \+ (.*)$", read(output)))


def copy_tree(tree):
    """Copies what is new, so that what is built of the rest stays good."""
    wanted = set(lines_of("git", "-C", SOURCE, "ls-files", "--cached", "--others", "--exclude-standard"))
    for path in wanted:
        source, copy = os.path.join(SOURCE, path), os.path.join(tree, path)
        if not os.path.exists(source):
            continue
        if not os.path.exists(copy) or open(source, "rb").read() != open(copy, "rb").read():
            os.makedirs(os.path.dirname(copy), exist_ok=True)
            shutil.copyfile(source, copy)
            shutil.copymode(source, copy)
    for root, _, names in os.walk(os.path.join(tree, "LogGenerator")):
        for name in names:
            if os.path.relpath(os.path.join(root, name), tree) not in wanted:
                os.remove(os.path.join(root, name))


class House:
    """The copy, how its files are compiled, and what the tests need without a change."""

    def __init__(self, directory):
        self.directory = directory
        self.tree = os.path.realpath(os.path.join(directory, "tree"))
        self.build = os.path.join(directory, "build")
        os.makedirs(self.tree, exist_ok=True)
        copy_tree(self.tree)
        if not os.path.exists(os.path.join(self.build, "build.ninja")):
            linker = ["-DCMAKE_EXE_LINKER_FLAGS=-fuse-ld=lld"] if shutil.which("ld.lld") else []
            subprocess.run(
                ["cmake", "-S", self.tree, "-B", self.build, "-G", "Ninja", "-DCMAKE_BUILD_TYPE=",
                 "-DCMAKE_CXX_FLAGS=-O0", "-DCMAKE_CXX_COMPILER_LAUNCHER=", "-DVELMORA_BENCHMARKS=OFF", *linker],
                check=True, stdout=subprocess.DEVNULL,
            )
        programs = [SHARED, *PROGRAMS.values()]
        subprocess.run(["ninja", "-C", self.build, "--quiet", *programs], check=True)
        self.links = {
            name: shlex.split(lines_of("ninja", "-C", self.build, "-t", "commands", f"tests/{name}")[-1])[2:-2]
            for name in programs
        }
        self.compilers = {}  # by object
        for entry in json.loads(read(os.path.join(self.build, "compile_commands.json"))):
            words = shlex.split(entry["command"])
            self.compilers[words[words.index("-o") + 1]] = words, os.path.relpath(entry["file"], self.tree)
        self.users = {}  # path to the objects that are made of it
        target = None
        for line in lines_of("ninja", "-C", self.build, "-t", "deps"):
            if line and not line[0].isspace():
                target = line.split(": #deps")[0]
            elif target in self.compilers and line.strip().startswith(self.tree + "/"):
                self.users.setdefault(os.path.relpath(line.strip(), self.tree), []).append(target)
        self.common = os.path.join(directory, "common.h")
        write(self.common, "".join(f"#include {name}\n" for name in COMMON))
        words = next(words for words, path in self.compilers.values() if path.startswith("LogGenerator/"))
        words = words[: words.index("-o")] + ["-x", "c++-header", self.common, "-o", self.common + ".gch"]
        subprocess.run(words, cwd=self.build, check=True)
        self.limits = {}
        for name in programs:
            start = time.monotonic()
            if not self.passes(name, os.path.join(self.build, "tests", name), directory, limit=300):
                sys.exit(f"{name} fails without a change")
            self.limits[name] = 10 + 10 * (time.monotonic() - start)

    def passes(self, name, program, scratch, limit=None):
        environment = dict(os.environ, TMPDIR=scratch, XDG_RUNTIME_DIR=scratch)
        test = subprocess.Popen(
            [program, "--gtest_brief=1", "--gtest_fail_fast"], cwd=scratch, env=environment, start_new_session=True,
            stdin=subprocess.DEVNULL, stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL,
        )
        try:
            return test.wait(limit or self.limits[name]) == 0
        except subprocess.TimeoutExpired:
            os.killpg(test.pid, signal.SIGKILL)  # with what it has started
            test.wait()
            return False

    def is_wide(self, change):
        return change.path.endswith(".h") and len(self.users.get(change.path, [])) > WIDE

    def objects(self, change, program, all_of_them):
        """What is to be made anew for a test program. At -O0 the linker takes an inline function from the first
        object that has it; so it is mostly enough to make those anew that use what is computed when they are
        compiled."""
        linked = set(self.links[program])
        for target in self.users.get(change.path, []):
            path = self.compilers[target][1]
            if path.startswith("LogGenerator/"):
                technology = path.split("/")[1] if path.count("/") > 1 else None
                wanted = not self.is_wide(change) or not technology or PROGRAMS.get(technology, SHARED) == program
            else:
                wanted = f'#include "{change.path}"' in read(os.path.join(self.tree, path))
            if (wanted or all_of_them) and (target in linked or path.startswith("LogGenerator/")):
                yield target

    def compile(self, change, lane, target):
        """The object with the change, or None where it does not compile."""
        words, path = self.compilers[target]
        overlay = os.path.join(lane, "overlay")
        made = os.path.join(lane, target.replace("/", "_"))
        words = list(words)
        words[words.index("-o") + 1] = made
        if path == change.path:
            words[-1] = os.path.join(overlay, path)
        words[1:1] = [f"-I{overlay}"] + (["-include", self.common] if path.startswith("LogGenerator/") else [])
        done = subprocess.run(words, cwd=self.build, check=False, stderr=subprocess.DEVNULL)
        return made if done.returncode == 0 else None

    def try_it(self, change, lane):
        """What came of a change: "noticed", "survived" or "not compiled"."""
        shutil.rmtree(lane, ignore_errors=True)
        write(os.path.join(lane, "overlay", change.path), change.changed)
        own = PROGRAMS.get(change.group(), SHARED)
        programs = [own, SHARED] if own != SHARED else [SHARED]
        if change.group() == "shared":
            programs += PROGRAMS.values()
        compiled = {}
        # What seems to survive in a header is looked at again with everything made anew.
        turns = itertools.product([False, True] if change.path.endswith(".h") else [False], programs)
        for all_of_them, program in turns:
            for target in self.objects(change, program, all_of_them):
                if target not in compiled:
                    compiled[target] = self.compile(change, lane, target)
                if compiled[target] is None:
                    return "not compiled"
            command = list(self.links[program])
            linked = os.path.join(lane, program)
            command[command.index("-o") + 1] = linked
            command = [compiled.get(word, word) for word in command]
            first = next(i for i, word in enumerate(command) if word.endswith(".o"))
            command[first:first] = [made for target, made in compiled.items() if target.startswith("LogGenerator/")]
            subprocess.run(command, cwd=self.build, check=True)
            if not self.passes(program, linked, lane):
                return "noticed"
        return "survived"


def in_turn(house, changes, seed):
    """All changes, in the order in which they are taken: the groups take turns, and each is shuffled."""
    groups, wide = {}, []
    for change in changes:
        (wide if house.is_wide(change) else groups.setdefault(change.group(), [])).append(change)
    chance = random.Random(seed)
    for group in [*(groups[name] for name in sorted(groups)), wide]:
        chance.shuffle(group)
    turns = itertools.zip_longest(*(groups[name] for name in sorted(groups)))
    taken = 0
    for change in (change for turn in turns for change in turn if change):
        taken += 1
        if wide and taken % WIDE_SHARE == 0:
            yield wide.pop()
        yield change
    yield from wide


def main():
    parser = argparse.ArgumentParser(description=__doc__.partition("\n\n")[0])
    parser.add_argument("--sample", type=int, default=300, metavar="N", help="so many that compile; 0 for all")
    parser.add_argument("--seed", type=int, default=1, metavar="N", help="of the choice")
    parser.add_argument("--jobs", type=int, default=os.cpu_count(), metavar="N", help="so many side by side")
    parser.add_argument("--directory", default=os.path.join(SOURCE, "build", "mutate"), help="for the copy")
    parser.add_argument("--again", metavar="OUTPUT", help="what an earlier run printed")
    parser.add_argument("places", nargs="*", metavar="FILE[:LINE]")
    options = parser.parse_args()
    resource.setrlimit(resource.RLIMIT_AS, (MEMORY, MEMORY))  # a changed program may ask for any amount
    resource.setrlimit(resource.RLIMIT_CORE, (0, 0))

    house = House(os.path.abspath(options.directory))
    changes = []
    for root, _, names in sorted(os.walk(os.path.join(house.tree, "LogGenerator"))):
        for name in sorted(names):
            if name.endswith((".cpp", ".h")):
                path = os.path.join(root, name)
                changes.extend(changes_of(os.path.relpath(path, house.tree), read(path)))
    known = equivalents()
    outdated = known - {change.key() for change in changes}
    if options.places:
        changes = [c for c in changes if c.path in options.places or f"{c.path}:{c.line}" in options.places]
    if options.again:
        earlier = survivors(options.again)
        changes = [change for change in changes if change.key() in earlier]
    if not changes:
        sys.exit("nothing to change there, wanted FILE or FILE:LINE as LogGenerator/Base.cpp:20")
    print(f"{len(changes)} changes are possible", flush=True)

    sequence = in_turn(house, changes, options.seed)
    counts = {"noticed": 0, "survived": 0, "equivalent": 0, "not compiled": 0}
    lock = threading.Lock()

    def work(number):
        lane = os.path.join(house.directory, f"lane-{number}")
        while True:
            with lock:
                counted = sum(counts.values()) - counts["not compiled"]
                change = None if 0 < options.sample <= counted else next(sequence, None)
            if change is None:
                return
            outcome = "equivalent" if change.key() in known else house.try_it(change, lane)
            with lock:
                counts[outcome] += 1
                print(f"{outcome} {change}", flush=True)

    start = time.monotonic()
    with ThreadPoolExecutor(options.jobs) as pool:
        for done in [pool.submit(work, number) for number in range(options.jobs)]:
            done.result()
    tried = sum(counts.values())
    took = time.monotonic() - start
    print(", ".join(f"{count} {outcome}" for outcome, count in counts.items()))
    print(f"{took:.0f} s, {took / max(tried, 1):.1f} s a change")
    for path, before, after in sorted(outdated):
        print(f"mutations-equivalent: no longer possible: {path}\n    - {before}\n    + {after}")
    return 1 if counts["survived"] or outdated else 0
