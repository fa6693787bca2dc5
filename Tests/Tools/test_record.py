# SPDX-License-Identifier: Apache-2.0
"""kelvasictl record beside a simulated daemon, both as processes."""

import os
import resource
import signal
import stat
import time
import unittest

from live_support import PATIENCE, LiveTest, packets
from support import MM_IDLE, pcap, record
from wire_daemon import WireDaemon, wire

MANY = [record(0x7131, count.to_bytes(4, "little")) for count in range(5000)]


class Record(LiveTest):
    def recorded(self):
        return [message for _, message in packets(self.read("a.pcap"))]

    def replay(self, *messages, speed="max"):
        world = self.write("world.pcap", pcap(*messages))
        return self.start_daemon("--replay", world, "--speed", speed, "--leave")

    def start_record(self, *arguments, **options):
        return self.start_live("record", self.path("a.pcap"), *arguments, **options)

    def file_reaches(self, size):
        return os.path.exists(self.path("a.pcap")) and os.path.getsize(self.path("a.pcap")) >= size

    def test_what_the_daemon_sent_before_the_signal_is_in_the_file(self):
        for number in (signal.SIGINT, signal.SIGTERM):
            with self.subTest(number):
                daemon = self.replay(*MANY)
                recorder = self.start_record("--force")
                self.assertEqual(daemon.wait(PATIENCE), 0)
                status, out, error = self.end(recorder, number)
                self.assertEqual((status, out), (0, b""))
                self.assertEqual(error, f"kelvasictl: 5000 messages recorded in {self.path('a.pcap')}\n")
                self.assertEqual(self.recorded(), MANY)

    def test_stamps_are_those_of_arrival(self):
        before = time.time()
        self.replay((0.0, MM_IDLE), (0.5, MM_IDLE), speed="1")
        recorder = self.start_record()
        self.wait_until(lambda: self.file_reaches(24 + 2 * (16 + len(MM_IDLE))))
        self.assertEqual(self.end(recorder)[0], 0)
        (first, _), (second, _) = packets(self.read("a.pcap"))
        self.assertTrue(before - 0.001 <= first < second <= time.time(), (before, first, second))

    def test_a_killed_recorder_leaves_whole_messages(self):
        self.start_daemon("--replay", self.write("world.pcap", pcap(*MANY)), "--speed", "max", "--loop")
        recorder = self.start_record()
        self.wait_until(lambda: self.file_reaches(100_000))
        recorder.kill()
        recorder.wait(PATIENCE)
        messages = self.recorded()
        self.assertGreater(len(messages), 2000)
        self.assertEqual(messages[:5000], MANY[:len(messages)])

    def limited_to(self, size):
        """A recorder whose files may not grow past `size`."""
        def limit():
            signal.signal(signal.SIGXFSZ, signal.SIG_IGN)
            resource.setrlimit(resource.RLIMIT_FSIZE, (size, resource.RLIM_INFINITY))
        return self.start_live("record", self.path("a.pcap"), "--force", preexec_fn=limit)

    def test_a_file_that_may_not_grow_ends_with_its_last_whole_message(self):
        messages = [record(0x7131, bytes([number]) * size) for number, size in ((1, 4200), (2, 40), (3, 5000))]
        ends = [24]
        for message in messages:
            ends.append(ends[-1] + 16 + len(message))
        for size in sorted({end + change for end in ends[1:] for change in (-4096, -1, 0, 1, 100)} - {ends[-1] + 1}):
            with self.subTest(size):
                if os.path.exists(self.path("a.pcap")):
                    os.remove(self.path("a.pcap"))
                whole = messages[:sum(end <= size for end in ends[1:])]
                daemon = self.replay(*messages)
                recorder = self.limited_to(size)
                if len(whole) == len(messages):
                    self.assertEqual(daemon.wait(PATIENCE), 0)
                    recorder.send_signal(signal.SIGINT)
                error = recorder.communicate(timeout=PATIENCE)[1].decode().splitlines()
                said = [f"kelvasictl: {len(whole)} messages recorded in {self.path('a.pcap')}"]
                if len(whole) < len(messages):
                    said.append(f"kelvasictl: {self.path('a.pcap')}: File too large")
                self.assertEqual(error, said)
                self.assertEqual(recorder.returncode, len(said) - 1)
                self.assertEqual(self.recorded(), whole)
                self.stop(daemon)

    def test_an_older_file_stays_unless_it_is_forced(self):
        older = self.write("a.pcap", b"older")
        self.assert_fault(self.run_program("record", older), "a.pcap: there is such a file already; --force overwrites it")
        self.assertEqual(self.read("a.pcap"), b"older")

    def test_an_older_file_stays_until_the_first_message(self):
        self.write("a.pcap", b"older")
        recorder = self.start_record("--force", "--seconds", "0.2")
        error = recorder.communicate(timeout=PATIENCE)[1].decode()
        self.assertIn(f"0 messages recorded in {self.path('a.pcap')}, which stays as it was\n", error)
        self.assertEqual((recorder.returncode, self.read("a.pcap")), (1, b"older"))
        self.assertEqual(sorted(os.listdir(self.directory.name)), ["a.pcap", "run"])

        daemon = self.replay(MM_IDLE)
        recorder = self.start_record("--force")
        self.assertEqual(daemon.wait(PATIENCE), 0)
        self.assertEqual(self.end(recorder)[0], 0)
        self.assertEqual(self.recorded(), [MM_IDLE])

    def test_the_file_is_its_owners_alone_whatever_the_umask(self):
        for mask in (0o000, 0o077, 0o777):
            with self.subTest(mask):
                recorder = self.start_record("--force", "--seconds", "0", preexec_fn=lambda: os.umask(mask))
                recorder.communicate(timeout=PATIENCE)
                self.assertEqual(stat.S_IMODE(os.stat(self.path("a.pcap")).st_mode), 0o600)
                os.remove(self.path("a.pcap"))

    def test_it_goes_on_with_the_next_daemon(self):
        first = self.replay(*MANY[:10])
        recorder = self.start_record()
        self.assertEqual(first.wait(PATIENCE), 0)
        second = self.replay(*MANY[10:20])
        self.assertEqual(second.wait(PATIENCE), 0)
        self.assertEqual(self.end(recorder)[0], 0)
        self.assertEqual(self.recorded(), MANY[:20])

    def test_a_message_that_a_decoder_dies_of_is_kept(self):
        deadly = record(0x0000, b"no property list", log_type=0xFF)
        daemon = self.start_daemon("--replay", self.write("world.pcap", pcap(deadly, MM_IDLE)), "--leave")
        recorder = self.start_record()
        self.assertEqual(daemon.wait(PATIENCE), 0)
        self.assertEqual(self.end(recorder)[0], 0)
        # The daemon sends what is subscribed to, and the SIM files are once they are decoded.
        self.assertEqual(self.recorded()[-1], MM_IDLE)

    UNKNOWN = [record(0x7199, b"unknown"), record(0xB193, b"unknown too"), record(0x0007, b"[]", log_type=0xFF)]

    def record_unknown(self, *options):
        daemon = self.start_daemon("--replay", self.write("world.pcap", pcap(*self.UNKNOWN, MM_IDLE)), "--leave")
        recorder = self.start_record("--force", *options)
        self.assertEqual(daemon.wait(PATIENCE), 0)
        self.assertEqual(self.end(recorder)[0], 0)
        return self.recorded()

    def test_what_the_display_does_not_show_is_not_asked_for(self):
        self.assertEqual(self.record_unknown(), [MM_IDLE])

    def test_more_is_recorded_on_request(self):
        self.assertEqual(self.record_unknown("--code", "0x7199"), [self.UNKNOWN[0], MM_IDLE])
        self.assertEqual(self.record_unknown("--code", "0x7199", "--code", "45459", "--code", "0xFF0007"),
                         [*self.UNKNOWN, MM_IDLE])
        self.assertEqual(self.record_unknown("--all-codes", "0xB000-0xB1FF"), [self.UNKNOWN[1], MM_IDLE])

    def test_all_codes_that_there_are(self):
        self.assertEqual(self.record_unknown("--all-codes", "0-0xFFFF", "--all-codes", "0xFF0000-0xFFFFFF"),
                         [*self.UNKNOWN, MM_IDLE])

    def test_a_code_that_is_none_is_said(self):
        for option, value, words in (
                ("--code", "0x10000", '"0x10000" is no log code'),
                ("--code", "many", '"many" is no log code'),
                ("--all-codes", "7", '"7" is no range of log codes such as 0xB000-0xB1FF'),
                ("--all-codes", "9-7", '"9-7" is no range'),
                ("--all-codes", "0xFFFF-0xFF0001", '"0xFFFF-0xFF0001" is no range')):
            with self.subTest(value):
                recorder = self.start_record(option, value)
                _, error = recorder.communicate(timeout=PATIENCE)
                self.assertEqual(recorder.returncode, 2)
                self.assertIn(words, error.decode())

    def test_the_file_is_a_capture_from_the_start(self):
        recorder = self.start_record("--seconds", "0.2")
        _, error = recorder.communicate(timeout=PATIENCE)
        self.assertEqual(recorder.returncode, 1)
        self.assertEqual(error.decode().splitlines(), [
            f"kelvasictl: waiting for a telephony daemon in {self.path('run')}",
            f"kelvasictl: 0 messages recorded in {self.path('a.pcap')}",
            f"kelvasictl: nothing came from a telephony daemon in {self.path('run')}",
        ])
        self.assertEqual(self.decode(self.path("a.pcap")).stdout, b"null\n")

    def replayed(self, contents):
        """What the daemon says of a capture that it plays to its end; the path of that is left out."""
        world = self.write("world.pcap", contents)
        daemon = self.start_daemon("--replay", world, "--speed", "max", "--leave")
        self.start_record()
        error = daemon.communicate(timeout=PATIENCE)[1].decode()
        self.assertEqual(daemon.returncode, 0, error)
        return [line.replace(world, "FILE") for line in error.splitlines() if line.startswith("telvon-sim: ")]

    def test_a_daemon_tells_of_a_capture_cut_inside_a_packet(self):
        said, end = self.replayed(pcap(MM_IDLE, MM_IDLE)[:-1])
        self.assertTrue(said.startswith("telvon-sim: FILE: byte 56: truncated"), said)
        self.assertEqual(end, "telvon-sim: the capture has been played")

    def test_a_daemon_tells_of_packets_that_were_captured_in_part(self):
        in_part = bytearray(pcap(MM_IDLE, MM_IDLE, MM_IDLE))
        for number in (1, 2):  # the length that the packet had before it was captured
            in_part[24 + number * (16 + len(MM_IDLE)) + 12] += 1
        cut = f"is cut, {len(MM_IDLE)} of {len(MM_IDLE) + 1} bytes are there; it is skipped"
        self.assertEqual(self.replayed(bytes(in_part)), [
            f"telvon-sim: FILE: byte {24 + 16 + len(MM_IDLE)}: message 2 {cut}",
            f"telvon-sim: FILE: byte {24 + 2 * (16 + len(MM_IDLE))}: message 3 {cut}",
            "telvon-sim: the capture has been played",
        ])

    def test_a_place_that_cannot_be_written_is_named(self):
        self.assert_fault(self.run_program("record", self.path("missing/a.pcap")), "missing/a.pcap: No such file")
        self.assert_fault(self.run_program("record", "/dev/full"), "/dev/full: No space left on device")


class RecordFromTheWire(LiveTest):
    """What the socket holds when the recording ends."""

    def setUp(self):
        super().setUp()
        os.mkdir(self.path("run"), 0o700)
        self.daemon = WireDaemon(self.path("run"))
        self.addCleanup(self.daemon.close)

    def start_record(self, *arguments):
        """A recorder that has written a first message, and the connection for more."""
        recorder = self.start_live("record", self.path("a.pcap"), *arguments)
        messages = self.daemon.serve(self.daemon.open_channel())
        messages.send(wire.frame(wire.MESSAGE, MM_IDLE))
        self.wait_for_size(24 + 16 + len(MM_IDLE))
        return recorder, messages

    def wait_for_size(self, size):
        self.wait_until(lambda: os.path.exists(self.path("a.pcap")) and os.path.getsize(self.path("a.pcap")) >= size)

    def fill(self, connection, sent):
        connection.socket.setblocking(False)
        try:
            while True:
                message = record(0x7131, len(sent).to_bytes(8000, "little"))
                frame = wire.frame(wire.MESSAGE, message)
                self.assertEqual(connection.socket.send(frame), len(frame))
                sent.append(message)
        except BlockingIOError:
            pass

    def stop_and_fill(self, recorder, messages):
        """Stops the recorder and sends it what its sockets take, on a connection that it has yet to accept too."""
        os.kill(recorder.pid, signal.SIGSTOP)
        os.waitpid(recorder.pid, os.WUNTRACED)
        sent = []
        self.fill(messages, sent)
        self.fill(self.daemon.connect(), sent)
        return sent

    def check(self, recorder, sent):
        error = recorder.communicate(timeout=PATIENCE)[1].decode()
        self.assertEqual(recorder.returncode, 0, error)
        first, *others = [message for _, message in packets(self.read("a.pcap"))]
        self.assertEqual(first, MM_IDLE)
        self.assertEqual(sorted(message[13] for message in others), list(range(len(sent))))
        self.assertTrue(all(message in sent for message in others))
        self.assertEqual(error, f"kelvasictl: {1 + len(sent)} messages recorded in {self.path('a.pcap')}\n")

    def test_all_of_it_is_in_the_file_after_a_signal(self):
        for number in (signal.SIGINT, signal.SIGTERM):
            with self.subTest(number):
                recorder, messages = self.start_record("--force")
                sent = self.stop_and_fill(recorder, messages)
                recorder.send_signal(number)
                recorder.send_signal(signal.SIGCONT)
                self.check(recorder, sent)

    def test_all_of_it_is_in_the_file_after_the_stated_time(self):
        started = time.monotonic()
        recorder, messages = self.start_record("--seconds", "10")
        sent = self.stop_and_fill(recorder, messages)
        time.sleep(max(0.0, started + 11 - time.monotonic()))
        recorder.send_signal(signal.SIGCONT)
        self.check(recorder, sent)

    def test_a_malformed_frame_costs_its_connection_only(self):
        recorder, messages = self.start_record()
        messages.send(bytes(16))  # version 0
        self.daemon.connect().send(wire.frame(wire.MESSAGE, MM_IDLE))
        self.wait_for_size(24 + 2 * (16 + len(MM_IDLE)))
        self.assertEqual(self.end(recorder)[0], 0)
        self.assertEqual([message for _, message in packets(self.read("a.pcap"))], [MM_IDLE, MM_IDLE])

    def test_a_message_that_no_capture_takes_is_cut_and_reported(self):
        recorder, messages = self.start_record()
        large = bytes(300_000)
        for message in (large, bytes(262_144), large + b"!", MM_IDLE):
            messages.send(wire.frame(wire.MESSAGE, message))
        self.wait_for_size(24 + 5 * 16 + 2 * len(MM_IDLE) + 3 * 262_144)
        status, _, error = self.end(recorder)
        self.assertEqual(status, 0)
        file = self.path("a.pcap")
        self.assertEqual(error.splitlines(), [
            "kelvasictl: message 2 has 300000 bytes; a capture takes 262144, the rest is lost",
            f"kelvasictl: 5 messages recorded in {file}, 2 of them cut",
        ])
        sizes = [len(message) for _, message in packets(self.read("a.pcap"))]
        self.assertEqual(sizes, [len(MM_IDLE), 262_144, 262_144, 262_144, len(MM_IDLE)])


if __name__ == "__main__":
    unittest.main()
