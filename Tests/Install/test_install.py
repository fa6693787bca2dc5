# SPDX-License-Identifier: Apache-2.0
"""What is installed, where it is found again, and how a packager configures and compiles."""

import json
import os
import pathlib
import shlex
import shutil
import subprocess
import tempfile
import unittest

from dissected import AS_A_USER
from live_support import PATIENCE, LiveTest
from support import MM_IDLE, pcap

CMAKE = os.environ["CMAKE"]
BUILD = os.environ["BUILD"]
SOURCES = pathlib.Path(os.environ["SOURCES"])

PROGRAMS = {"bin/kelvasi", "bin/kelvasictl", "bin/telvon-sim"}
TEMPLATES = {f"share/kelvasi/{name}" for name in ("C2KTemplate.plist", "LTE.plist", "Orvane_GSM.plist", "UTRAN.plist")}
DESKTOP = {f"share/{name}" for name in (
    "applications/org.kelvasi.Decode.desktop", "applications/org.kelvasi.Kelvasi.desktop",
    "dbus-1/services/org.kelvasi.Kelvasi.service", "icons/hicolor/scalable/apps/org.kelvasi.Kelvasi.svg",
    "icons/hicolor/symbolic/apps/org.kelvasi.Kelvasi-symbolic.svg", "metainfo/org.kelvasi.Kelvasi.metainfo.xml",
    "mime/packages/org.kelvasi.Kelvasi.xml")}
UNITS = {f"lib/systemd/user/{name}.service" for name in ("kelvasi-kiosk", "kelvasi-record", "telvon-sim")}
# One for each program at least, and as many more as there are verbs and formats.
MADE = {"share/man/man1/kelvasi.1", "share/man/man1/kelvasictl-decode.1", "share/man/man5/kelvasi-capture.5",
        "share/bash-completion/completions/kelvasictl", "share/zsh/site-functions/_kelvasictl",
        "share/fish/vendor_completions.d/kelvasictl.fish"}
MADE_FOLDERS = ("share/man/", "share/bash-completion/", "share/zsh/", "share/fish/")
HELPERS = {"libexec/kelvasi/show-captures"}
WIRESHARK = {f"share/kelvasi/wireshark/{path.name}" for path in (SOURCES / "Resources/wireshark").glob("[!k]*")} | {
    "lib/wireshark/extcap/kelvasi-extcap", "lib/wireshark/plugins/kelvasi.lua"}
DOCUMENTS = {f"share/doc/kelvasi/{name}" for name in (
    "LICENSE", "CHANGELOG.md", "Notices/README.md", "Notices/LICENSE.CLI11", "Notices/LICENSE.LGPL-2.1",
    "Notices/LICENSE.nlohmann-json")}


def cmake(*arguments, **variables):
    return subprocess.run([CMAKE, *map(str, arguments)], env=os.environ | variables, capture_output=True, text=True,
                          timeout=10 * PATIENCE, check=True)  # it compiles, beside whatever else does


class Installed(LiveTest):
    """Staged for /opt/kelvasi, then moved to where no build ever heard of."""

    @classmethod
    def setUpClass(cls):
        directory = tempfile.TemporaryDirectory()
        cls.addClassCleanup(directory.cleanup)
        cmake("--install", BUILD, "--prefix", "/opt/kelvasi", DESTDIR=directory.name + "/stage")
        cls.prefix = pathlib.Path(shutil.move(directory.name + "/stage/opt/kelvasi", directory.name + "/moved"))

    def setUp(self):
        super().setUp()
        screen = {"name": "screen", "x": 0, "y": 0, "width": 1000, "height": 900}
        path = self.write("screen.json", json.dumps({"screens": [screen]}).encode())
        self.environment |= {"HOME": self.directory.name, "XDG_RUNTIME_DIR": self.directory.name,
                             "QT_QPA_PLATFORM": "offscreen:configfile=" + path}

    def lose_templates(self):
        templates = self.prefix / "share/kelvasi"
        lost = templates.rename(self.prefix / "lost")
        self.addCleanup(lost.rename, templates)

    def program(self, name):
        return self.prefix / "bin" / name

    def run_installed(self, name, *arguments, **options):
        return subprocess.run([self.program(name), *arguments], env=self.environment, capture_output=True, text=True,
                              timeout=PATIENCE, check=False, **options)

    def state_of_viewer(self, program="kelvasi", script="state\n"):
        result = self.run_installed(program, "--script", "-", input=script)
        self.assertEqual((result.returncode, result.stderr), (0, ""))
        return json.loads(next(line for line in result.stdout.splitlines() if line.startswith("{")))

    def test_the_programs_and_what_they_need_are_there(self):
        files = {str(path.relative_to(self.prefix)) for path in self.prefix.rglob("*") if path.is_file()}
        self.assertLess(MADE, files)
        files = {name for name in files if not name.startswith(MADE_FOLDERS)}
        self.assertEqual(files, PROGRAMS | TEMPLATES | DESKTOP | UNITS | HELPERS | WIRESHARK | DOCUMENTS)

    def test_all_of_it_is_taken_away_again_and_nothing_else(self):
        with tempfile.TemporaryDirectory() as root:
            prefix = pathlib.Path(root, "usr")
            cmake("--install", BUILD, "--prefix", "/usr", DESTDIR=root)
            others = prefix / "share/applications/other.desktop"
            others.touch()
            cmake("--build", BUILD, "--target", "uninstall", DESTDIR=root)
            left = [path for path in prefix.rglob("*") if path.is_file() or path.name == "kelvasi"]
        self.assertEqual(left, [others])

    def test_captures_are_decoded(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        for technology, branch in (("Orvane_GSM", "Registration"), ("Orvane_LTE", "Serving Cell"),
                                   ("Orvane_UTRAN2", "Serving Cell"), ("Orvane_CDMA", "1x")):
            result = self.run_installed("kelvasictl", "decode", "--technology", technology, capture)
            self.assertEqual(result.returncode, 0, result.stderr)
            self.assertTrue(any(branch in name for name in json.loads(result.stdout)), result.stdout)

    def test_the_viewer_shows_what_the_simulated_daemon_sends(self):
        daemon = self.start([self.program("telvon-sim"), "--technology", "Orvane_GSM"])
        self.await_line(daemon, "serving")
        monitor = self.run_installed("kelvasictl", "monitor", "--once", "--format", "tree")
        self.assertIn("/Registration\t", monitor.stdout, monitor.stderr)
        state = self.state_of_viewer(script="await-status Updated\nstate\n")
        self.assertIn(["Registration"], state["rows"])
        self.assertIsNone(state["alert"])

    def test_without_templates_the_window_says_so_and_where_they_were_sought(self):
        self.lose_templates()
        said = self.state_of_viewer()["alert"]
        self.assertEqual(said["title"], "No display templates")
        self.assertIn(f"{self.prefix}/share/kelvasi", said["message"])

    def test_without_templates_kelvasictl_says_what_to_do(self):
        self.lose_templates()
        result = self.run_installed("kelvasictl", "decode", "--technology", "Orvane_GSM",
                                    self.write("a.pcap", pcap(MM_IDLE)))
        self.assertEqual(result.returncode, 1)
        self.assertEqual(result.stderr, f"kelvasictl: {self.prefix}/share/kelvasi: No such file or directory; "
                                        "--resources or KELVASI_RESOURCES names where the display templates are\n")

    def test_wireshark_finds_the_dissector_and_the_links(self):
        capture = self.write("a.pcap", pcap(MM_IDLE))
        found = {"WIRESHARK_PLUGIN_DIR": f"{self.prefix}/lib/wireshark/plugins", "HOME": self.directory.name}
        shown = subprocess.run([*AS_A_USER, "tshark", "-r", capture, "-Y", 'kelvasi.gsm.process_cs.mm_state == "MM_IDLE"'],
                               env=self.environment | found, capture_output=True, text=True, timeout=PATIENCE, check=True)
        self.assertIn("GSM 0x7131 Process CO, Process CS", shown.stdout)
        script = (self.prefix / "lib/wireshark/extcap/kelvasi-extcap").read_text(encoding="utf-8")
        self.assertEqual(script.splitlines()[-1], 'exec "/opt/kelvasi/bin/kelvasictl" extcap "$@"')
        made = self.run_installed("kelvasictl", "dissector")
        self.assertEqual(made.stdout, (self.prefix / "lib/wireshark/plugins/kelvasi.lua").read_text(encoding="utf-8"))

    def test_a_link_to_a_program_finds_them_too(self):
        link = self.path("link")
        os.symlink(self.program("kelvasi"), link)
        self.assertIsNone(self.state_of_viewer(program=link)["alert"])


class Configured(unittest.TestCase):
    """What each source is compiled with, in a build tree of its own."""

    @staticmethod
    def configure(build, *arguments):
        cmake("-S", SOURCES, "-B", build, *arguments, CXXFLAGS="", CPPFLAGS="")
        commands = json.loads(pathlib.Path(build, "compile_commands.json").read_text())
        return {os.path.relpath(command["file"], SOURCES): shlex.split(command["command"]) for command in commands}

    @classmethod
    def setUpClass(cls):
        with tempfile.TemporaryDirectory() as build:
            cls.plain = cls.configure(build)

    def test_plainly_it_is_optimised_programs_and_nothing_else(self):
        commands = self.plain
        for source in ("Tools/Kelvasi/main.cpp", "Tools/Kelvasictl/main.cpp", "Tools/TelvonSim/main.cpp"):
            self.assertIn("-O3", commands[source])
        self.assertEqual({pathlib.Path(source).parts[0] for source in commands} & {"Tests", "Bench", "Fuzz"}, set())
        for source, command in commands.items():
            self.assertNotIn("-Werror", command, source)

    def test_the_flags_of_packages_stay_and_bring_no_warning_about_the_build_time(self):
        """Two libraries are built with them: what needs a system's headers, and plain C++."""
        flags = [subprocess.run(["dpkg-buildflags", "--get", name], capture_output=True, text=True,
                                check=True).stdout.strip() for name in ("CXXFLAGS", "CPPFLAGS")]
        with tempfile.TemporaryDirectory() as build:
            command = self.configure(build, f"-DCMAKE_CXX_FLAGS={' '.join(flags)}", "-DCMAKE_BUILD_TYPE=None",
                                     "-DCMAKE_COMPILE_WARNING_AS_ERROR=ON")["Platform/Posix/BuildTime.cpp"]
            self.assertLess({"-O2", "-Wdate-time", "-Werror", "-fstack-protector-strong"}, set(command))
            self.assertNotIn("-O3", command)
            built = cmake("--build", build, "--target", "kelvasi_platform_posix", "kelvasi_plist")
        self.assertNotIn("warning", built.stdout + built.stderr)

    def test_no_path_of_the_build_comes_into_the_programs(self):
        for source, command in self.plain.items():
            self.assertIn(f"-ffile-prefix-map={SOURCES}=.", command, source)

    def test_a_package_that_is_missing_is_named(self):
        with tempfile.TemporaryDirectory() as build, self.assertRaises(subprocess.CalledProcessError) as caught:
            cmake("-S", SOURCES, "-B", build, "-DKELVASI_PROVIDERS=/missing/providers.xml")
        said = " ".join(caught.exception.stderr.split())
        self.assertIn("/missing/providers.xml is missing. Install Debian's package mobile-broadband-provider-info", said)


if __name__ == "__main__":
    unittest.main()
