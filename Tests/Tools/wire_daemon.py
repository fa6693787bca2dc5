# SPDX-License-Identifier: Apache-2.0
"""A telephony daemon in the hands of a test, which may do with its sockets what no honest daemon does."""

import pathlib
import sys

sys.path.append(str(pathlib.Path(__file__).resolve().parent.parent / "Platform" / "Qt"))
import telvon_wire as wire

PORT = "test.port"
PATIENCE = 60  # seconds until somebody who never comes fails the test


class WireDaemon:
    def __init__(self, directory):
        """The directory exists and is private."""
        self._directory = wire.Directory(directory)
        self._server = self._listen("telvon")
        self._port = self._listen(PORT)
        self._connections = []
        self._application = None

    def close(self):
        for socket in [self._server, self._port, *self._connections]:
            socket.close()

    def open_channel(self):
        """Grants the log channel; the connection on which commands come."""
        asking = self._accept(self._server)
        kind, _, token, name = asking.read_frame()
        assert kind == wire.CHANNEL_REQUEST, kind
        self._application = name.decode()
        asking.send(wire.frame(wire.CHANNEL_ANSWER, wire.answer(PORT), token=token))
        return self._accept(self._port)

    def serve(self, commands):
        """Answers "GetTechnology", takes the start command and returns the connection for log messages."""
        kind, _, token, data = commands.read_frame()
        assert kind == wire.REQUEST and b"GetTechnology" in data, data
        technology = b"kTelvonLogChannelTechnology_Orvane_GSM"
        reply = b"<plist><dict><key>GetTechnology</key><string>" + technology + b"</string></dict></plist>"
        commands.send(wire.frame(wire.REPLY, reply, token=token))
        kind, _, _, data = commands.read_frame()
        assert kind == wire.MESSAGE and b"Streaming" in data, data
        return self.connect()

    def connect(self):
        """A connection for log messages."""
        return self._keep(self._directory.connect(self._application))

    def _listen(self, name):
        listener = self._directory.listen(name)
        listener.settimeout(PATIENCE)
        return listener

    def _accept(self, listener):
        return self._keep(self._directory.accept(listener))

    def _keep(self, connection):
        connection.socket.settimeout(PATIENCE)
        self._connections.append(connection)
        return connection
