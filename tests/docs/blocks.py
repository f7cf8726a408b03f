#!/usr/bin/env python3
"""Runs or compiles every block of code in the pages, and fails at one that it cannot test.

usage: blocks.py ROOT BUILD SCRATCH

ROOT is the source tree, BUILD a build of it with its tools, SCRATCH an empty folder. What a block is:

cpp      a program, which is compiled and run; a ```text block behind it is its output. Without main: a part of a
         program of the guides, or lines of tests/debugger/views.cpp, which the tests run.
sh       commands, run at the top of the tree. /opt/tessal is a folder of SCRATCH, and apt-get only simulates.
         Behind "<!-- suite: NAME... -->": what these suites of ./test do.
console  commands behind "$ " with their output, run by one shell in a folder of SCRATCH, with the tools of BUILD in its
         path. "..." stands for any lines.
cmake    a part of a project that uses the library installed in /opt/tessal.
args, gdb, prom   are run by the tests that read their page.

Blocks without a language are drawings and examples of text: no commands.
"""

import os
import pathlib
import re
import subprocess
import sys
import textwrap

ROOT, BUILD, SCRATCH = (pathlib.Path(argument).resolve() for argument in sys.argv[1:4])
OPT = SCRATCH / "opt"
FENCE = re.compile(r"^(?:<!-- suite: (?P<suites>[^>\n]*) -->\n)?```(?P<language>\w*)\n(?P<text>.*?)^```$", re.M | re.S)
ENVIRONMENT = dict(os.environ, PATH=f"{BUILD / 'examples'}:{os.environ['PATH']}", TERM="dumb", LC_ALL="C.UTF-8",
                   CMAKE_PREFIX_PATH=str(OPT))
LIMITED = ["timeout", "600"]


class Failure(Exception):
    """What is wrong with a block."""


class Block:
    def __init__(self, page, match, following):
        self.page, self.language, self.text = page, match["language"], match["text"]
        self.suites = (match["suites"] or "").split()
        self.line = match.string.count("\n", 0, match.start("text"))
        self.output = following["text"] if following is not None and following["language"] == "text" else None

    def __str__(self):
        return f"{self.page.relative_to(ROOT)}:{self.line}"


def blocks_of(page):
    matches = list(FENCE.finditer(page.read_text(encoding="utf-8")))
    return [Block(page, match, following) for match, following in zip(matches, matches[1:] + [None])]


def run(command, directory):
    """What a command prints; a failure when it fails."""
    done = subprocess.run([*LIMITED, *command], cwd=directory, env=ENVIRONMENT, text=True, check=False,
                          stdin=subprocess.DEVNULL, stdout=subprocess.PIPE, stderr=subprocess.STDOUT)
    if done.returncode != 0:
        raise Failure(f"status {done.returncode} of {command}:\n{done.stdout}")
    return done.stdout


def fresh_folder(block):
    folder = SCRATCH / str(block).replace("/", "_").replace(":", "_")
    folder.mkdir()
    return folder


def build_program(block):
    folder = fresh_folder(block)
    (folder / "main.cpp").write_text(block.text, encoding="utf-8")
    run(["g++", "-std=c++17", "-Wall", "-Wextra", "-Werror", "-DTESSALUTILITY_STATIC", f"-I{ROOT / 'include'}",
         "main.cpp", BUILD / "libTessalUtility.a", "-pthread", "-o", "program"], folder)
    printed = run(["./program"], folder)
    if block.output is not None and printed != block.output:
        raise Failure(f"it prints\n{printed}")


def stripped_lines(text):
    return [line.strip() for line in text.splitlines() if line.strip()]


def stands_in(wanted, path):
    lines = stripped_lines(path.read_text(encoding="utf-8"))
    if path.name == "views.cpp":
        return set(wanted) <= set(lines)
    return any(lines[i:i + len(wanted)] == wanted for i in range(len(lines)))


def check_cpp(block):
    sources = [*(ROOT / "examples/guides").glob("*.cpp"), ROOT / "tests/debugger/views.cpp"]
    if "int main(" in block.text:
        build_program(block)
    elif not any(stands_in(stripped_lines(block.text), source) for source in sources):
        raise Failure("neither a program nor a part of one in examples/guides")


def check_sh(block):
    for suite in block.suites:
        if not (ROOT / f"tests/suites/{suite}.sh").is_file():
            raise Failure(f"there is no suite {suite}")
    if not block.suites:
        text = block.text.replace("/opt/tessal", str(OPT)).replace("apt-get install", "apt-get install --simulate")
        run(["bash", "-euo", "pipefail", "-c", text], ROOT)


def check_cmake(block):
    folder = fresh_folder(block)
    program = next((other for other in blocks_of(block.page) if "int main(" in other.text), None)
    if program is None:
        raise Failure("the page has no program to build")
    (folder / "main.cpp").write_text(program.text, encoding="utf-8")
    (folder / "CMakeLists.txt").write_text(
        "cmake_minimum_required(VERSION 3.22)\nproject(Page CXX)\nfind_package(TessalUtility 0.1 REQUIRED)\n"
        "add_executable(my_program main.cpp)\n" + block.text, encoding="utf-8")
    run(["cmake", "-B", "build"], folder)
    run(["cmake", "--build", "build"], folder)
    if run(["build/my_program"], folder) != program.output:
        raise Failure("the program prints something else than the page says")


def matches(printed, wanted):
    pattern = "".join("(?:.*\n)*?" if line == "..." else re.escape(line) + "\n" for line in wanted)
    return re.fullmatch(pattern, printed) is not None


def ask(shell, command, wanted):
    """What a shell prints for the command; one in the background prints as many lines as are wanted."""
    shell.stdin.write(f"{command}\nstatus=$?; echo =done=; (exit $status)\n")
    shell.stdin.flush()
    lines, is_done, is_behind = [], False, command.endswith("&")
    while not is_done or (is_behind and len(lines) < len(wanted)):
        line = shell.stdout.readline()
        if not line:
            break
        if line == "=done=\n":
            is_done = True
        else:
            lines.append(line)
    return "".join(lines)


def check_console(block):
    session = [part.splitlines() for part in re.split(r"^\$ ", block.text, flags=re.M)[1:]]
    if not session:
        raise Failure("no command behind $")
    with subprocess.Popen([*LIMITED, "bash"], cwd=fresh_folder(block), env=ENVIRONMENT, text=True,
                          stdin=subprocess.PIPE, stdout=subprocess.PIPE, stderr=subprocess.STDOUT) as shell:
        for command, *wanted in session:
            while wanted and command.endswith("\\"):
                command += "\n" + wanted.pop(0)
            printed = ask(shell, command, wanted)
            if not matches(printed, wanted):
                raise Failure(f"$ {command}\nprints\n{printed}")


def check_read_by_test(block):
    names = [path for path in (ROOT / "tests").rglob("*") if path.suffix in (".cpp", ".py")]
    if not any(block.page.name in path.read_text(encoding="utf-8", errors="replace") for path in names):
        raise Failure(f"no test reads {block.page.name}")


def check_text(block):
    for line in block.text.splitlines():
        if re.match(r"(\$|\./|cmake|g\+\+|apt-get|doxygen|export) ", line):
            raise Failure(f"a block without a language holds a command: {line}")


CHECKS = {"cpp": check_cpp, "sh": check_sh, "console": check_console, "cmake": check_cmake, "args": check_read_by_test,
          "gdb": check_read_by_test, "prom": check_read_by_test, "text": check_text, "": check_text}


def main():
    failures, tested = 0, 0
    for page in [*sorted(ROOT.glob("*.md")), *sorted((ROOT / "docs").glob("*.md"))]:
        for block in blocks_of(page):
            try:
                if block.language not in CHECKS:
                    raise Failure(f"nothing tests a block of {block.language}")
                CHECKS[block.language](block)
                tested += block.language not in ("", "text")
            except Failure as failure:
                print(f"{block}: {failure}\n{textwrap.indent(block.text, '    ')}", file=sys.stderr)
                failures += 1
    print(f"{tested} blocks of code compiled or run")
    return 1 if failures else 0


sys.exit(main())
