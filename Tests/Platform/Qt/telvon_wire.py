# SPDX-License-Identifier: Apache-2.0
"""The log channel in Python, written from Docs/log-channel.md and nothing else."""

import fcntl
import os
import re
import socket
import struct

HEADER = struct.Struct("<IBBHII")
VERSION = 1
MAXIMUM_DATA = 16 * 1024 * 1024

MESSAGE, REQUEST, REPLY, EMPTY_REPLY, CHANNEL_REQUEST, CHANNEL_ANSWER, NOTIFICATION = range(1, 8)


def frame(kind, data=b"", message_id=0, token=0):
    return HEADER.pack(len(data), VERSION, kind, 0, message_id, token) + data


def answer(name, domain=0, code=0):
    return struct.pack("<ii", domain, code) + name.encode()


class Connection:
    def __init__(self, connected):
        self.socket = connected
        self.uid = struct.unpack("iii", connected.getsockopt(socket.SOL_SOCKET, socket.SO_PEERCRED, 12))[1]

    def send(self, data):
        self.socket.sendall(data)

    def read(self, count):
        """Exactly so many bytes; fewer at the end of the connection."""
        data = b""
        while len(data) < count:
            some = self.socket.recv(count - len(data))
            if not some:
                break
            data += some
        return data

    def read_frame(self):
        """(kind, message id, token, data), or None at the end of the connection."""
        header = self.read(HEADER.size)
        if len(header) < HEADER.size:
            return None
        length, version, kind, reserved, message_id, token = HEADER.unpack(header)
        assert version == VERSION and reserved == 0 and length <= MAXIMUM_DATA, header
        return kind, message_id, token, self.read(length)

    def has_ended(self):
        try:
            return self.socket.recv(1) == b""
        except ConnectionResetError:
            return True

    def close(self):
        self.socket.close()


class Directory:
    """A runtime directory that was checked already."""

    def __init__(self, path):
        self.path = path

    def connect(self, name):
        connected = socket.socket(socket.AF_UNIX)
        connected.connect(os.path.join(self.path, name))
        return Connection(connected)

    def listen(self, name):
        path = os.path.join(self.path, name)
        lock = os.open(os.path.join(self.path, ".lock"), os.O_RDWR | os.O_CREAT, 0o600)
        try:
            fcntl.flock(lock, fcntl.LOCK_EX)
            listener = socket.socket(socket.AF_UNIX)
            listener.bind(path)
            listener.listen()
            return listener
        finally:
            os.close(lock)

    @staticmethod
    def accept(listener):
        return Connection(listener.accept()[0])


def documented_frames(path):
    """The bytes of every frame that the document types out, in its order."""
    with open(path, encoding="utf-8") as document:
        blocks = re.findall(r"^```\n(.*?)^```$", document.read(), re.MULTILINE | re.DOTALL)
    byte_columns = (re.match(r"(?:[0-9a-f]{2} ?)+(?= |$)", line) for block in blocks for line in block.splitlines())
    assert all(byte_columns), "a line of a block does not begin with bytes"
    return [
        b"".join(bytes.fromhex(re.match(r"(?:[0-9a-f]{2} ?)+(?= |$)", line).group()) for line in block.splitlines())
        for block in blocks
    ]
