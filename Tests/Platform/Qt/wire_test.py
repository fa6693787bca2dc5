# SPDX-License-Identifier: Apache-2.0
"""A stranger's daemon and viewer against this project's: `wire_test.py WIRE_PEER DOCUMENT`.

The C++ side is the program WIRE_PEER in one of its roles; it prints what happens to it.
"""

import os
import re
import shutil
import socket
import subprocess
import sys
import tempfile
import unittest

import telvon_wire as wire

WIRE_PEER, DOCUMENT = os.path.abspath(sys.argv[1]), os.path.abspath(sys.argv[2])
NOBODY = 65534
PATIENTLY = "30000"  # milliseconds, where a reply is sure to come
MISPLACED = "frame of a kind or size that has no place here; connection closed"


class Peer:
    """The C++ side in a process of its own."""

    def __init__(self, directory, *arguments, program=WIRE_PEER, uid=None):
        self.process = subprocess.Popen(
            [program, *arguments],
            env={**os.environ, "TELVON_RUNTIME_DIR": directory},
            stdout=subprocess.PIPE,
            user=uid,
        )

    def line(self):
        return self.process.stdout.readline().decode().rstrip("\n")

    def rest(self):
        """What it prints until it ends by itself."""
        return self.process.stdout.read().decode().splitlines()

    def end(self):
        if self.process.stdout.closed:
            return []
        self.process.terminate()
        lines = self.rest()
        self.process.wait()
        self.process.stdout.close()
        return lines


class WireTest(unittest.TestCase):
    def setUp(self):
        self.path = tempfile.mkdtemp(prefix="kelvasi-")
        self.addCleanup(shutil.rmtree, self.path)
        self.directory = wire.Directory(self.path)

    def start(self, *arguments, **options):
        peer = Peer(self.path, *arguments, **options)
        self.addCleanup(peer.end)
        return peer

    def start_ready(self, *arguments):
        peer = self.start(*arguments)
        self.assertEqual(peer.line(), "ready")
        return peer

    def listen(self, name):
        listener = self.directory.listen(name)
        self.addCleanup(listener.close)
        return listener


class DocumentedSession(WireTest):
    """The bytes of the document are those that cross the wire."""

    def setUp(self):
        super().setUp()
        self.frames = wire.documented_frames(DOCUMENT)
        self.data = [frame[wire.HEADER.size:] for frame in self.frames]

    def test_viewer_sends_what_is_documented_and_takes_what_is_documented(self):
        server = self.listen("telvon")
        channel = self.listen(self.data[1][8:].decode())
        viewer = self.start("session", self.data[2].decode(), self.data[4].decode(), "1")

        asking = self.directory.accept(server)
        self.assertEqual(asking.uid, os.geteuid())
        request = asking.read(len(self.frames[0]))
        own_name = request[wire.HEADER.size:]
        self.assertRegex(own_name.decode(), r"^KelvasiApp\.[0-9a-f-]{36}$")
        self.assertEqual(request, self.frames[0].replace(self.data[0], own_name))
        asking.send(self.frames[1])
        self.assertEqual(viewer.line(), "answer 0 0 [Telvon.network-monitor]")
        self.assertTrue(asking.has_ended())

        commands = self.directory.accept(channel)
        self.assertEqual(commands.read(len(self.frames[2])), self.frames[2])
        commands.send(self.frames[3])
        self.assertEqual(viewer.line(), "status 0 reply [%s]" % self.data[3].decode())
        self.assertEqual(commands.read(len(self.frames[4])), self.frames[4])
        self.assertEqual(viewer.line(), "status 0 reply none")

        records = self.directory.connect(own_name.decode())
        records.send(self.frames[5])
        self.assertEqual(viewer.rest(), ["message 0 %d [%s]" % (len(self.data[5]), self.data[5].decode())])
        self.assertTrue(records.has_ended())
        self.assertTrue(commands.has_ended())
        self.assertNotIn(own_name.decode(), os.listdir(self.path))

    def test_daemon_answers_what_is_documented(self):
        daemon = self.start_ready("daemon", self.data[1][8:].decode())
        asking = self.directory.connect("telvon")
        asking.send(self.frames[0])
        self.assertEqual(daemon.line(), "asked " + self.data[0].decode())
        self.assertEqual(asking.read_frame(), (wire.NOTIFICATION, 0, 0, b"asked"))
        self.assertEqual(asking.read(len(self.frames[1])), self.frames[1])

    def test_port_replies_under_the_token(self):
        self.start_ready("receive", "port")
        asking = self.directory.connect("port")
        asking.send(wire.frame(wire.REQUEST, b"ask", 7, 0xABCDEF01) + wire.frame(wire.REQUEST, b"nothing", 7, 2))
        self.assertEqual(asking.read_frame(), (wire.REPLY, 0, 0xABCDEF01, b"ask"))
        self.assertEqual(asking.read_frame(), (wire.EMPTY_REPLY, 0, 2, b""))


class MalformedToPort(WireTest):
    """What a C++ port does with bytes that no honest peer sends."""

    def setUp(self):
        super().setUp()
        self.port = self.start_ready("receive", "port")
        self.bystander = self.directory.connect("port")
        self.peer = self.directory.connect("port")

    def check_closed(self, line):
        self.assertEqual(self.port.line(), "log 3 port: " + line)
        self.assertTrue(self.peer.has_ended())
        self.check_serving()

    def check_serving(self):
        self.bystander.send(wire.frame(wire.MESSAGE, b"bystander"))
        self.assertEqual(self.port.line(), "message 0 9 [bystander]")
        self.assertEqual(self.port.end(), [])

    def test_frame_over_16_mib(self):
        self.peer.send(wire.HEADER.pack(wire.MAXIMUM_DATA + 1, 1, wire.MESSAGE, 0, 0, 0))
        self.check_closed("frame of more than 16 MiB; connection closed")

    def test_frame_of_exactly_16_mib(self):
        self.peer.send(wire.frame(wire.MESSAGE, b"x" * wire.MAXIMUM_DATA))
        self.assertEqual(self.port.line(), "message 0 16777216 [%s]" % ("x" * 64))
        self.check_serving()

    def test_unknown_kind(self):
        self.peer.send(wire.frame(200))
        self.check_closed("frame of an unknown kind; connection closed")

    def test_misplaced_kind(self):
        self.peer.send(wire.frame(wire.NOTIFICATION))
        self.check_closed(MISPLACED)

    def test_unknown_version(self):
        self.peer.send(wire.HEADER.pack(0, 2, wire.MESSAGE, 0, 0, 0))
        self.check_closed("frame of an unknown version; connection closed")

    def test_reserved_bytes(self):
        self.peer.send(wire.HEADER.pack(0, 1, wire.MESSAGE, 1, 0, 0))
        self.check_closed("frame with reserved bytes in use; connection closed")

    def test_header_cut_short(self):
        self.peer.send(wire.frame(wire.MESSAGE)[:15])
        self.peer.socket.shutdown(socket.SHUT_WR)
        self.check_closed("ended inside a frame; connection closed")

    def test_data_cut_short(self):
        self.peer.send(wire.frame(wire.MESSAGE, b"four")[:-1])
        self.peer.socket.shutdown(socket.SHUT_WR)
        self.check_closed("ended inside a frame; connection closed")

    def test_length_zero_is_a_message(self):
        self.peer.send(wire.frame(wire.MESSAGE, b"", 9))
        self.assertEqual(self.port.line(), "message 9 0 []")
        self.check_serving()

    def test_bytes_one_at_a_time(self):
        for byte in wire.frame(wire.REQUEST, b"dribble", 3, 5):
            self.peer.send(bytes([byte]))
        self.assertEqual(self.port.line(), "message 3 7 [dribble]")
        self.assertEqual(self.peer.read_frame(), (wire.REPLY, 0, 5, b"dribble"))
        self.check_serving()


class MalformedToSender(WireTest):
    """What a C++ sender does with a peer that misbehaves."""

    def ask(self, *requests):
        listener = self.listen("port")
        sender = self.start("request", "port", *(requests or [PATIENTLY, "ask"]))
        return sender, self.directory.accept(listener)

    def test_reply_over_16_mib(self):
        sender, peer = self.ask()
        peer.read_frame()
        peer.send(wire.HEADER.pack(0xFFFFFFFF, 1, wire.REPLY, 0, 0, 1))
        self.assertEqual(
            sender.rest(),
            ["log 3 port: frame of more than 16 MiB; connection closed", "status -5 reply none", "valid 0"],
        )

    def test_empty_reply_with_data(self):
        sender, peer = self.ask()
        token = peer.read_frame()[2]
        peer.send(wire.frame(wire.EMPTY_REPLY, b"!", 0, token))
        self.assertEqual(sender.rest(), ["log 3 port: " + MISPLACED, "status -5 reply none", "valid 0"])

    def test_death_instead_of_a_reply(self):
        sender, peer = self.ask()
        peer.read_frame()
        peer.close()
        self.assertEqual(sender.rest(), ["status -5 reply none", "valid 0"])

    def test_reply_that_dribbles_in_time(self):
        sender, peer = self.ask()
        token = peer.read_frame()[2]
        for byte in wire.frame(wire.REPLY, b"slowly", 0, token):
            peer.send(bytes([byte]))
        self.assertEqual(sender.rest(), ["status 0 reply [slowly]", "valid 1"])

    def test_reply_that_never_ends(self):
        sender, peer = self.ask("50", "ask")
        token = peer.read_frame()[2]
        peer.send(wire.HEADER.pack(1000, 1, wire.REPLY, 0, 0, token))
        self.assertEqual(sender.rest(), ["status -2 reply none", "valid 1"])

    def test_reply_after_its_time_out(self):
        sender, peer = self.ask("50", "first", PATIENTLY, "second")
        first = peer.read_frame()
        self.assertEqual(sender.line(), "status -2 reply none")
        second = peer.read_frame()
        peer.send(wire.frame(wire.REPLY, b"late", 0, first[2]) + wire.frame(wire.REPLY, b"good", 0, second[2]))
        self.assertEqual(sender.line(), "status 0 reply [good]")


class MalformedFromServer(WireTest):
    """What a C++ application says of a daemon's answers."""

    def answer_to(self, *frames, timeout=PATIENTLY):
        server = self.listen("telvon")
        application = self.start("application", "port", timeout)
        asking = self.directory.accept(server)
        self.assertEqual(asking.read_frame(), (wire.CHANNEL_REQUEST, 0, 1, b"port"))
        for frame in frames:
            asking.send(frame)
        if not frames:
            asking.close()
        return application.rest()

    def test_errors_of_the_daemon(self):
        frame = wire.frame(wire.CHANNEL_ANSWER, wire.answer("", 3, -12), 0, 1)
        self.assertEqual(self.answer_to(frame), ["answer 3 -12 none"])

    def test_answers_to_other_requests(self):
        other = wire.frame(wire.CHANNEL_ANSWER, wire.answer("other"), 0, 99)
        right = wire.frame(wire.CHANNEL_ANSWER, wire.answer("right"), 0, 1)
        self.assertEqual(self.answer_to(other, right), ["answer 0 0 [right]"])

    def test_notification_before_the_answer(self):
        right = wire.frame(wire.CHANNEL_ANSWER, wire.answer("right"), 0, 1)
        lines = self.answer_to(wire.frame(wire.NOTIFICATION, b"first"), right)
        self.assertEqual(lines[0], "answer 0 0 [right]")

    def test_answer_of_seven_bytes(self):
        self.assertEqual(
            self.answer_to(wire.frame(wire.CHANNEL_ANSWER, bytes(7), 0, 1)),
            ["log 3 telvon: " + MISPLACED, "answer 1 71 none"],
        )

    def test_no_answer(self):
        only = wire.frame(wire.NOTIFICATION, b"only this")
        self.assertEqual(self.answer_to(only, timeout="50")[0], "answer 1 110 none")

    def test_end_instead_of_an_answer(self):
        self.assertEqual(self.answer_to(), ["answer 1 104 none"])


class Privacy(WireTest):
    def lines_in(self, directory, **options):
        peer = Peer(directory, "receive", "port", **options)
        lines = peer.rest()
        peer.end()
        return lines

    def refused(self, directory, why):
        return ['log 3 Runtime directory "%s" refused: %s' % (directory, why), "refused"]

    def test_directory_open_to_others(self):
        os.chmod(self.path, 0o755)
        self.assertEqual(self.lines_in(self.path), self.refused(self.path, "its mode is not 0700"))

    def test_symbolic_link(self):
        link = os.path.join(self.path, "link")
        os.mkdir(os.path.join(self.path, "real"), 0o700)
        os.symlink("real", link)
        self.assertEqual(self.lines_in(link), self.refused(link, "is a symbolic link"))


@unittest.skipUnless(os.geteuid() == 0, "only root can be two users")
class OtherUser(Privacy):
    def as_nobody(self, task):
        """Runs the task in a child of another user; true when it returned true."""
        child = os.fork()
        if child == 0:
            os.setgroups([])
            os.setgid(NOBODY)
            os.setuid(NOBODY)
            os._exit(0 if task() else 1)
        return os.waitstatus_to_exitcode(os.waitpid(child, 0)[1]) == 0

    def open_to_all(self):
        os.chmod(self.path, 0o777)
        for name in os.listdir(self.path):
            os.chmod(os.path.join(self.path, name), 0o777)

    def test_cannot_enter_the_directory(self):
        self.start_ready("receive", "port")

        def is_kept_out():
            try:
                self.directory.connect("port")
            except PermissionError:
                return True
            return False

        self.assertTrue(self.as_nobody(is_kept_out))

    def test_refuses_the_directory_of_another_user(self):
        with tempfile.TemporaryDirectory() as public:
            os.chmod(public, 0o755)
            program = shutil.copy(WIRE_PEER, public)
            lines = self.lines_in(self.path, program=program, uid=NOBODY)
        self.assertEqual(lines, self.refused(self.path, "belongs to another user"))

    def test_is_closed_by_a_port_before_a_byte_is_believed(self):
        port = self.start_ready("receive", "port")
        self.open_to_all()

        def is_closed():
            peer = self.directory.connect("port")
            try:
                peer.send(wire.frame(wire.REQUEST, b"let me in", 0, 1))
            except BrokenPipeError:
                return True
            return peer.has_ended()

        self.assertTrue(self.as_nobody(is_closed))
        self.check_refusal(port.line())
        self.assertEqual(port.end(), [])

    def test_is_not_believed_as_a_listener(self):
        os.chmod(self.path, 0o777)
        ends, starts = os.pipe(), os.pipe()

        def listens():
            listener = self.directory.listen("port")
            os.write(starts[1], b".")
            os.read(ends[0], 1)
            connection = self.directory.accept(listener)
            return connection.has_ended()

        child = os.fork()
        if child == 0:
            os._exit(0 if self.as_nobody(listens) else 1)
        os.read(starts[0], 1)
        os.chmod(self.path, 0o700)
        lines = self.start("request", "port", PATIENTLY, "secret").rest()
        os.write(ends[1], b".")
        self.assertEqual(os.waitstatus_to_exitcode(os.waitpid(child, 0)[1]), 0)
        self.check_refusal(lines[0])
        self.assertEqual(lines[1:], ["no port"])

    def check_refusal(self, line):
        self.assertTrue(
            re.fullmatch(
                r"log 3 port: peer \(pid \d+\) is of another user \(uid 65534\); connection closed", line
            ),
            line,
        )


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1], warnings="ignore")
