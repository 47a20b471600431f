#!/usr/bin/env python3
"""Looks at the files that were built for Windows, and runs them under wine.
  windows.py FOLDER [PROCESSOR...]    the build's folder; the processors (i686, x86_64) whose programs wine can run
"""
import os
import shutil
import socket
import struct
import subprocess
import sys
import tempfile
import unittest

from portable_executable import PortableExecutable
from web_server import WebServer, answer, little_by_little, nothing, without_end

PROCESSORS = {"i686": (0x14C, "wx86"), "x86_64": (0x8664, "8664")}
MODES = ("GrayScaleMode, RGBMode, CMYKMode, HSLMode, HSBMode, MultichannelMode, DuotoneMode, LabMode, Gray16Mode, "
         "RGB48Mode, CMYK64Mode, Lab48Mode")
SENDING = "Unable to send data to server."


def property_list(entry_key):
    """What a host is to find, put together once more."""
    def one(key, data):
        return b"MIB8" + key.encode()[::-1] + struct.pack("<II", 0, len(data)) + data

    return struct.pack("<HII", 1, 0, 8) + b"".join((
        one("kind", b"MFB8"),
        one("catg", b"\x08Kestrand\0\0\0"),
        one("name", b"\x0aOrvela 2.0\0"),
        one("vers", struct.pack("<I", 4 << 16)),
        one(entry_key, b"PluginMain\0\0"),
        one("mode", bytes(4)),
        one("enbl", f"in (PSHOP_ImageMode, {MODES})".encode() + b"\0\0"),
        one("fici", b"\1\1\1\0" * 7)))


class BuiltFile(unittest.TestCase):
    def test_module_has_its_property_list_and_entry_point_and_needs_nothing_beside_it(self):
        for name, (processor, key) in PROCESSORS.items():
            with self.subTest(name):
                with open(f"{FOLDER}/{name}/Trial.8bf", "rb") as file:
                    module = PortableExecutable(file.read())
                self.assertEqual(module.processor, processor)
                self.assertEqual(module.resources(), {("PIPL", 16000, 1033): property_list(key)})
                self.assertEqual(len(property_list(key)), 374)
                self.assertEqual(module.exports(), ["PluginMain"])
                self.assertLessEqual(set(module.imports()), {"kernel32.dll", "msvcrt.dll", "user32.dll"})


class Wine(unittest.TestCase):
    """Programs of one processor; it is None in the class itself, whose tests do not run."""
    processor = None

    def run_program(self, program, *arguments):
        folder = f"{FOLDER}/{self.processor}"
        return subprocess.run(["wine", f"{folder}/{program}.exe", *arguments], env=ENVIRONMENT, cwd=FOLDER,
                              stdout=subprocess.PIPE, stderr=subprocess.DEVNULL, timeout=120, check=False)

    def ask(self, *arguments):
        done = self.run_program("ask_platform", *arguments)
        self.assertEqual(done.returncode, 0, arguments)
        return done.stdout.decode()

    def post(self, port, limit=20000, host="127.0.0.1"):
        """(milliseconds, error, reply)"""
        spent, error, reply = self.ask("post", host, str(port), "folder/script.php", "p=1&w=a%20b", "Agent",
                                       str(limit)).split("\n", 2)
        return int(spent), error, reply

    def test_host_runs_the_module_from_a_folder_of_its_own(self):
        module = f"{FOLDER}/{self.processor}/Zusätze 日本/A.B.8bf"
        os.makedirs(os.path.dirname(module), exist_ok=True)
        shutil.copy(f"{FOLDER}/{self.processor}/Trial.8bf", module)
        native = "Z:" + module.replace("/", "\\")
        done = self.run_program("trial_host", native)
        expected = f"file: {native}\nproperties: {property_list(PROCESSORS[self.processor][1]).hex()}\n"
        self.assertEqual(done.stdout.decode().replace("\r", ""), expected * 2)
        self.assertEqual(done.returncode, 0)

    def test_system_answers(self):
        up, down, told, up_again = map(int, self.ask("keys").split())
        self.assertEqual((up, told, up_again), (0, 7, 0))
        self.assertNotEqual(down, 0)
        self.assertEqual(self.ask("log", "C:\\Füller"), "C:\\Füller\\orvela.log")
        self.assertEqual(self.ask("windows").strip(), "windows")
        self.assertIn(self.ask("help", "C:\\missing.chm::/welcome.htm"), ("0 0 ", "1 1 "))

    def test_web_gets_the_form_and_gives_the_reply_whatever_its_status(self):
        for reply in (answer("an answer"), answer("oops", "500 Internal Server Error"), answer("")):
            with WebServer(reply) as server:
                _, error, body = self.post(server.port)
            self.assertEqual((error, body), ("", reply.decode().split("\r\n\r\n")[1]))
            [(lines, sent)] = server.requests
            self.assertEqual((lines[0], sent), ("POST /folder/script.php HTTP/1.1", "p=1&w=a%20b"))
            for line in ("Content-Type: application/x-www-form-urlencoded", "User-Agent: Agent", "Content-Length: 11",
                         f"Host: 127.0.0.1:{server.port}"):
                self.assertIn(line, lines)

    def test_web_follows_a_redirection(self):
        with WebServer(answer("from elsewhere")) as other:
            moved = answer("moved", "302 Found", f"Location: http://127.0.0.1:{other.port}/there\r\n")
            with WebServer(moved) as server:
                self.assertEqual(self.post(server.port)[1:], ("", "from elsewhere"))

    def test_web_is_given_up_where_nothing_comes_or_too_slowly(self):
        for manner in (nothing, little_by_little):
            with self.subTest(manner.__name__), WebServer(answer("x" * 1000), manner) as server:
                spent, error, body = self.post(server.port, limit=700)
                self.assertEqual((error, body), (SENDING, ""))
                self.assertGreaterEqual(spent, 650)
                self.assertLess(spent, 2500)
        with socket.create_server(("127.0.0.1", 0)) as listener:
            closed = listener.getsockname()[1]
        self.assertEqual(self.post(closed)[1:], (SENDING, ""))
        with WebServer() as server:  # hangs up without a word, which wine takes for an empty reply
            self.assertIn(self.post(server.port)[1:], [(SENDING, ""), ("", "")])

    def test_web_reply_is_cut_where_it_is_too_long_or_breaks_off(self):
        with WebServer(b"x" * 1000, without_end) as server:
            spent, error, body = self.post(server.port)
        self.assertEqual((error, body), ("", "x" * 4096))
        self.assertLess(spent, 5000)
        self.assertEqual(server.dropped, 1)
        with WebServer(answer("x" * 100).replace(b": 100", b": 200")) as server:
            self.assertEqual(self.post(server.port)[1:], ("", "x" * 100))


def environment(prefix):
    """Without a display, a proxy, or what wine would offer to install."""
    names = ("DISPLAY", "WAYLAND_DISPLAY", "http_proxy", "HTTP_PROXY", "all_proxy", "ALL_PROXY")
    return {**{name: value for name, value in os.environ.items() if name not in names},
            "WINEPREFIX": prefix, "WINEDEBUG": "-all", "WINEDLLOVERRIDES": "mscoree,mshtml=",
            "LC_ALL": "C.UTF-8"}


if __name__ == "__main__":
    if len(sys.argv) < 2 or not set(sys.argv[2:]) <= set(PROCESSORS):
        sys.exit(__doc__)
    FOLDER = os.path.realpath(sys.argv[1])
    tests = unittest.TestSuite([unittest.defaultTestLoader.loadTestsFromTestCase(BuiltFile)])
    for each in sys.argv[2:]:
        under_wine = type(f"Wine_{each}", (Wine,), {"processor": each})
        tests.addTests(unittest.defaultTestLoader.loadTestsFromTestCase(under_wine))
    with tempfile.TemporaryDirectory(prefix="orvela-wine-", ignore_cleanup_errors=True) as scratch:
        ENVIRONMENT = environment(scratch)
        passed = unittest.TextTestRunner(verbosity=2).run(tests).wasSuccessful()
        if sys.argv[2:]:
            for end in ("--kill", "--wait"):
                subprocess.run(["wineserver", end], env=ENVIRONMENT, check=False)
    sys.exit(not passed)
