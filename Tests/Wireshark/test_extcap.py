# SPDX-License-Identifier: Apache-2.0
"""Wireshark's interfaces: what kelvasictl answers, and captures that come through its pipe."""

import os
import select

import dissected
from live_support import PATIENCE, LiveTest, packets
from support import PROGRAM

SSH = """#!/bin/sh
echo "$@" >"$SSH_SAW"
while [ "$1" != -- ]; do shift; done
exec $3
"""


class ExtcapTest(LiveTest):
    def setUp(self):
        super().setUp()
        programs = self.path("programs")
        os.mkdir(programs)
        for name, text in (("ssh", SSH), ("kelvasi-extcap", f'#!/bin/sh\nexec "{PROGRAM}" extcap "$@"\n')):
            self.write("programs/" + name, text.encode())
            os.chmod(self.path("programs/" + name), 0o755)
        self.environment |= {"PATH": programs + ":" + os.environ["PATH"], "SSH_SAW": self.path("saw"),
                             "WIRESHARK_EXTCAP_DIR": programs, "HOME": self.directory.name}

    def answer(self, *arguments):
        result = self.run_program("extcap", *arguments)
        self.assertEqual((result.returncode, result.stderr), (0, b""))
        return result.stdout.decode()

    def captured(self, *arguments):
        """The packets that come through a pipe as Wireshark makes it, up to the first and what came with it."""
        pipe = self.path("pipe")
        os.mkfifo(pipe)
        reader = os.open(pipe, os.O_RDONLY | os.O_NONBLOCK)  # does not wait for a writer that never comes
        self.addCleanup(os.close, reader)
        capture = self.start([PROGRAM, "extcap", "--capture", "--fifo", pipe, *arguments])
        contents = b""
        while len(contents) <= 24 and select.select([reader], [], [], PATIENCE)[0] and capture.poll() is None:
            contents += self.some(reader)
        capture.terminate()
        said = capture.communicate(timeout=PATIENCE)[1]
        contents += self.some(reader)
        self.assertEqual(capture.returncode, 0, said)
        return packets(contents)

    @staticmethod
    def some(reader):
        try:
            return os.read(reader, 1 << 20)
        except BlockingIOError:
            return b""


class Answers(ExtcapTest):
    def test_the_link_of_this_device_is_an_interface_while_its_daemon_listens(self):
        silent = self.answer("--extcap-interfaces", "--extcap-version=4.0")
        self.assertIn("extcap {version=", silent)
        self.assertNotIn("{value=kelvasi}", silent)
        self.assertIn("interface {value=kelvasi-ssh}", silent)
        self.start_daemon()
        self.assertIn("interface {value=kelvasi}{display=", self.answer("--extcap-interfaces"))

    def test_both_have_the_link_type_of_captures(self):
        for name in ("kelvasi", "kelvasi-ssh"):
            self.assertEqual(self.answer("--extcap-interface", name, "--extcap-dlts"),
                             "dlt {number=147}{name=USER0}{display=Kelvasi log channel}\n")

    def test_only_a_phone_has_to_be_named(self):
        there = self.answer("--extcap-interface", "kelvasi-ssh", "--extcap-config")
        self.assertIn("{call=--remote-host}", there)
        self.assertIn("{required=true}", there)
        self.assertNotIn("--remote", self.answer("--extcap-interface", "kelvasi", "--extcap-config"))

    def test_what_makes_no_sense_is_one_line(self):
        self.assert_fault(self.run_program("extcap", "--extcap-interface", "eth0", "--capture"), "eth0")
        self.assert_fault(self.run_program("extcap", "--extcap-interface", "kelvasi", "--capture"), "--fifo")
        ssh = ("extcap", "--extcap-interface", "kelvasi-ssh", "--capture", "--fifo", "/dev/null")
        self.assert_fault(self.run_program(*ssh), "--remote-host")
        result = self.run_program(*ssh, "--remote-host", "phone", "--remote-port", "70000")
        self.assertEqual(result.returncode, 2)


class Captures(ExtcapTest):
    def test_of_this_device(self):
        self.start_daemon()
        self.assertTrue(self.captured("--extcap-interface", "kelvasi"))

    def test_of_a_phone(self):
        self.start_daemon()
        got = self.captured("--extcap-interface", "kelvasi-ssh", "--remote-host", "phone", "--remote-port", "2222",
                            "--remote-username", "user", "--remote-command", PROGRAM, "--all-codes", "0xB000-0xB1FF")
        self.assertTrue(got)
        self.assertEqual(self.read("saw").decode(), f"-o BatchMode=yes -p 2222 -l user -- phone {PROGRAM} record - "
                                                    "--all-codes 0xB000-0xB1FF\n")

    def test_a_host_is_no_option_of_ssh(self):
        self.start_daemon()
        self.captured("--extcap-interface", "kelvasi-ssh", "--remote-host=-oProxyCommand=touch x",
                      "--remote-command", PROGRAM)
        self.assertIn("-- -oProxyCommand=touch x ", self.read("saw").decode())

    def test_tshark_lists_the_interface_and_captures_from_it(self):
        self.start_daemon()
        listed = dissected.tshark("-D", environment=self.environment, before=dissected.AS_A_USER)
        self.assertIn("kelvasi (Kelvasi: modem of this device)", listed.stdout)
        dissector = self.write("kelvasi.lua", self.run_program("dissector").stdout)
        got = dissected.tshark("-X", "lua_script:" + dissector, "-i", "kelvasi", "-c", "5",
                               environment=self.environment, before=dissected.AS_A_USER)
        self.assertEqual(got.stdout.count("Kelvasi"), 5, got.stderr)
