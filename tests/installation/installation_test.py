#!/usr/bin/env python3
"""Installs a build into a scratch folder, moves the installation, and uses it from there: the
programs run, modules are built for it by find_package and by pkg-config, and a session goes on when
the installation is removed under it. Nothing of the build tree is used after the first step."""
import argparse
import json
import os
import re
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


def read(path):
    with open(path, encoding="utf-8") as file:
        return file.read()


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
        kinds = [entity["type"] for entity in json.loads(read(drawing))["entities"]]
        self.assertGreater(kinds.count("MTEXT"), 5)

    def test_tzconvert_finds_the_font_map(self):
        text = r"{\Fromans|c0;a}"
        empty = scratch("empty.ini")
        open(empty, "w", encoding="utf-8").close()
        with_map = run(program("tzconvert"), "to-rtf", text=text)
        without = run(program("tzconvert"), "to-rtf", "--font-map", empty, text=text)
        self.assertNotEqual(with_map, without)


class Options(unittest.TestCase):
    PAGES = (("share/man/man1/{}.1", r"\-\-"), ("share/bash-completion/completions/{}", "--"),
             ("share/zsh/site-functions/_{}", "--"),
             ("share/fish/vendor_completions.d/{}.fish", "-l "))

    def test_stand_in_every_page_as_in_the_help(self):
        for name, command in (("tzdraft", []), ("tzconvert", ["to-mtext"])):
            told = run(program(name), *command, "--help")
            options = set(re.findall(r"^ +(?:-\w,)?--([\w-]+)", told, re.MULTILINE))
            self.assertGreater(len(options), 12)
            for page, sign in self.PAGES:
                text = read(os.path.join(PREFIX, page.format(name)))
                missing = [each for each in options
                           if sign + (each.replace("-", r"\-") if "man" in page else each)
                           not in text]
                self.assertEqual(missing, [], page)

    # An option whose help has no row in resources/de/options.texts is told in English.
    def test_are_told_in_german(self):
        for name in ("tzdraft", "tzconvert"):
            lists = [json.loads(run(program(name), "--option-list",
                                    env=os.environ | {"LC_ALL": locale}))
                     for locale in ("C", "de_DE.UTF-8")]
            told = [[option["help"] for command in whole["commands"] + [whole]
                     for option in command["options"]] for whole in lists]
            self.assertEqual([here for here, there in zip(*told) if here == there], [], name)
            manual = read(os.path.join(PREFIX, f"share/man/de/man1/{name}.1"))
            self.assertIn("zeigt diese Hilfe", manual.replace("Z", "z"))
        said = run(program("tzdraft"), "--locale=de", "--help")
        self.assertRegex(said, r"(?s)Aufruf: tzdraft \[OPTIONEN\].*--save DATEI +schreibt")

    # What is typed, and what bash and fish offer.
    ROWS = (("tzdraft --scr", ["--script"]), ("tzconvert to-r", ["to-rtf"]),
            ("tzdraft --save dr", ["drawn here"]), ("tzconvert to-rtf --output-dir fo", ["folder"]),
            ("tzconvert to-mtext --norm", ["--normalise"]), ("tzdraft --save locked/", []),
            ("tzdraft --save gone/", []), ("tzdraft --space pa", ["paper"]),
            ("tzdraft --paper A", ["A0", "A1", "A2", "A3", "A4"]),
            ("tzconvert to-rtf --locale d", ["de"]))

    def test_are_completed(self):
        place = scratch("typed")
        shutil.rmtree(place, ignore_errors=True)
        for folder in ("folder", "locked"):
            os.makedirs(os.path.join(place, folder))
        open(os.path.join(place, "drawn here"), "w", encoding="utf-8").close()
        os.chmod(os.path.join(place, "locked"), 0)
        share = os.path.join(PREFIX, "share")
        for line, offered in self.ROWS:
            name = line.split()[0]
            asked = (f'source "{share}/bash-completion/completions/{name}"; compopt() {{ :; }}; '
                     f'COMP_WORDS=({line}); [[ "{line}" != *" " ]] || COMP_WORDS+=(""); '
                     f'COMP_CWORD=$((${{#COMP_WORDS[@]}} - 1)); _{name}; '
                     'printf "%s\\n" "${COMPREPLY[@]}"')
            self.assertEqual(run("bash", "-c", asked, cwd=place).split("\n")[:-1],
                             offered or [""], f"bash: {line}")
            said = run("fish", "-c", f'source "{share}/fish/vendor_completions.d/{name}.fish"; '
                       f'complete -C "{line}"; true', cwd=place, env=os.environ | {"HOME": place})
            words = [each.split("\t")[0].rstrip("/") for each in said.splitlines()]
            self.assertEqual([word.replace("\\", "") for word in words], offered, f"fish: {line}")
            run("zsh", "-n", f"{share}/zsh/site-functions/_{name}")


class Modules(unittest.TestCase):
    def test_find_package_builds_the_second_module(self):
        source, build = scratch("stranger"), scratch("stranger/build")
        shutil.rmtree(source, ignore_errors=True)
        shutil.copytree(os.path.join(EXAMPLES, "second_module"), source)
        run("cmake", "-G", "Ninja", "-S", source, "-B", build, f"-DCMAKE_PREFIX_PATH={PREFIX}",
            f"-DCMAKE_CXX_COMPILER={COMPILER}", f"-DCMAKE_CXX_FLAGS={SANITIZE}")
        run("cmake", "--build", build)
        self.assertNotIn(BUILD + "/lib", read(os.path.join(build, "build.ninja")))
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
        texts = [entity["contents"] for entity in json.loads(read(drawing))["entities"]]
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
