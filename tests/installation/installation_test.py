#!/usr/bin/env python3
"""Installs a build into a scratch folder, moves the installation, and uses it from there: the
programs run, modules are built for it by find_package and by pkg-config, and a session goes on when
the installation is removed under it. Nothing of the build tree is used after the first step."""
import argparse
import json
import os
import shutil
import subprocess
import sys
import unittest

BUILD = COMPILER = SANITIZE = None
SOURCE = os.environ["TZ_TEST_SOURCE"]
SCRATCH = os.environ["TZ_TEST_SCRATCH"]
PREFIX = os.path.join(SCRATCH, "moved")
EXAMPLES = os.path.join(PREFIX, "share/doc/tzmted/examples")
LIBRARIES = None  # of the installation


def scratch(name):
    return os.path.join(SCRATCH, name)


def run(*command, text="", status=0, **options):
    """Both outputs of a command, which ends with that status."""
    done = subprocess.run(command, input=text, text=True, stdout=subprocess.PIPE,
                          stderr=subprocess.STDOUT, timeout=240, **options)
    if done.returncode != status:
        raise AssertionError(f"{command[0]} ended with {done.returncode}:\n{done.stdout}")
    return done.stdout


def program(name):
    return os.path.join(PREFIX, "bin", name)


def setUpModule():
    global LIBRARIES
    for name in ("prefix", "moved"):
        shutil.rmtree(scratch(name), ignore_errors=True)
    run("cmake", "--install", BUILD, "--prefix", scratch("prefix"))
    os.rename(scratch("prefix"), PREFIX)
    run(program("tzdraft"), "--version")
    found = [folder for folder, _, files in os.walk(PREFIX) if "libtz.so.1" in files]
    LIBRARIES = found[0]


def tearDownModule():
    shutil.rmtree(PREFIX, ignore_errors=True)


class Programs(unittest.TestCase):
    def test_tzdraft_plays_an_example_in_german(self):
        drawing = scratch("drawn.json")
        script = os.path.join(EXAMPLES, "title-block.scr")
        said = run(program("tzdraft"), "--script", script, "--save", drawing, "--locale", "de")
        self.assertIn("Erste Ecke angeben", said)
        with open(drawing, encoding="utf-8") as file:
            kinds = [entity["type"] for entity in json.load(file)["entities"]]
        self.assertGreater(kinds.count("MTEXT"), 5)

    def test_tzconvert_finds_the_font_map(self):
        text = r"{\Fromans|c0;a}"
        empty = scratch("empty.ini")
        open(empty, "w", encoding="utf-8").close()
        with_map = run(program("tzconvert"), "to-rtf", text=text)
        without = run(program("tzconvert"), "to-rtf", "--font-map", empty, text=text)
        self.assertNotEqual(with_map, without)


class Modules(unittest.TestCase):
    def test_find_package_builds_the_second_module(self):
        source, build = scratch("stranger"), scratch("stranger/build")
        shutil.rmtree(source, ignore_errors=True)
        shutil.copytree(os.path.join(EXAMPLES, "second_module"), source)
        run("cmake", "-G", "Ninja", "-S", source, "-B", build, f"-DCMAKE_PREFIX_PATH={PREFIX}",
            f"-DCMAKE_CXX_COMPILER={COMPILER}", f"-DCMAKE_CXX_FLAGS={SANITIZE}")
        run("cmake", "--build", build)
        with open(os.path.join(build, "build.ninja"), encoding="utf-8") as file:
            self.assertNotIn(BUILD + "/lib", file.read())
        said = run(program("tzdraft"), "--script", "-", text=f"LOAD\n{build}/sheetmarks.tzx\n"
                   "MARKSETUP\nMARKNOTE\nNew\nA note\n\nLIST\nlast\n\n")
        self.assertIn("Words of the text module: Justify", said)
        self.assertRegex(said, r"(?s)New: 1.*contents  *A note")

    def test_pkg_config_gives_the_flags(self):
        folder = os.path.join(LIBRARIES, "pkgconfig")
        flags = run("pkg-config", "--cflags", "--libs", "tzmted",
                    env=os.environ | {"PKG_CONFIG_PATH": folder}).split()
        run(COMPILER, "-std=c++20", "-fPIC", "-shared", "-Wl,-z,defs", *SANITIZE.split(),
            os.path.join(EXAMPLES, "second_module/posting.cpp"), *flags,
            "-o", scratch("posting.tzx"))


class Removal(unittest.TestCase):
    def test_a_session_goes_on_and_says_what_is_missing(self):
        other, drawing = scratch("removed"), scratch("kept.json")
        shutil.rmtree(other, ignore_errors=True)
        shutil.copytree(PREFIX, other, symlinks=True)
        with subprocess.Popen([os.path.join(other, "bin/tzdraft"), "--script", "-",
                               "--save", drawing], text=True, bufsize=1, stdin=subprocess.PIPE,
                              stdout=subprocess.PIPE, stderr=subprocess.STDOUT) as session:
            session.stdin.write("-MTEXT\n0,0\n10,5\nbefore\n\n")
            session.stdin.flush()
            while "before" not in session.stdout.readline():
                pass
            shutil.rmtree(other)
            said, _ = session.communicate("-MTEXT\n0,9\n10,5\n{\\Fromans|c0;after}\n\nHELP\n"
                                          "MTEXT\nMTEDIT\n0.1,8.9\n<<<\nchanged\n>>>\n\n"
                                          "UNLOAD\nLOAD\n\nQUIT\n", timeout=120)
        self.assertEqual(session.returncode, 1, said)
        self.assertIn(os.path.join(other, "lib") + "/", said)
        with open(drawing, encoding="utf-8") as file:
            texts = [entity["contents"] for entity in json.load(file)["entities"]]
        self.assertEqual(texts, ["before", "changed"], said)


if __name__ == "__main__":
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("--build", required=True)
    parser.add_argument("--compiler", required=True)
    parser.add_argument("--sanitize", default="")
    arguments, rest = parser.parse_known_args()
    BUILD, COMPILER = arguments.build, arguments.compiler
    SANITIZE = f"-fsanitize={arguments.sanitize}" if arguments.sanitize else ""
    unittest.main(argv=sys.argv[:1] + rest)
