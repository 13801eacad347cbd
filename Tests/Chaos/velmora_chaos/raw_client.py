# SPDX-FileCopyrightText: 2026 Velmora contributors
# SPDX-License-Identifier: MIT
"""A client of the telephony service made of bare sockets, and the frames that it sends."""

import plistlib
import socket
import struct
import time
from collections.abc import Mapping
from pathlib import Path
from typing import Any

from velmora_chaos.checks import expect, wait_for
from velmora_chaos.sandbox import Sandbox

REQUEST, REPLY, ONE_WAY = 1, 2, 4
HEADER = struct.Struct("<IiII")  # payload length, message id, flags, serial
CONNECT_S = 10
RETRY_S = 0.001


def frame(flags: int, payload: bytes, serial: int = 0) -> bytes:
    """A frame with its header."""
    return HEADER.pack(len(payload), 0, flags, serial) + payload


def connect(port: Path, limit_s: float = CONNECT_S) -> socket.socket:
    """A connection to a port; retried while the queue of those that wait to be accepted is full."""
    connection = socket.socket(socket.AF_UNIX)
    connection.settimeout(limit_s)
    end = time.monotonic() + limit_s
    while True:
        try:
            connection.connect(str(port))
            return connection
        except BlockingIOError:  # a time-out alone does not make the system wait for the queue
            if time.monotonic() >= end:
                connection.close()
                raise
            time.sleep(RETRY_S)
        except OSError:
            connection.close()
            raise


def wait_for_port(port: Path) -> None:
    """Waits until the port takes connections: its file is there a moment before."""

    def takes_connections() -> bool:
        try:
            connect(port).close()
        except (FileNotFoundError, ConnectionRefusedError):
            return False
        return True

    wait_for(f"the port {port.name}", takes_connections)


def received(connection: socket.socket, length: int) -> bytes:
    """So many bytes; raises Problem where the peer closes before. A socket with a time-out returns what has arrived,
    even where it is asked to wait for all."""
    data = bytearray()
    while len(data) < length:
        part = connection.recv(length - len(data))
        expect(part, "no reply")
        data += part
    return bytes(data)


def call(connection: socket.socket, request: Mapping[str, Any]) -> dict[str, Any]:
    """Sends a request and returns the reply's dictionary; an empty one for an empty reply."""
    connection.sendall(frame(REQUEST, plistlib.dumps(dict(request)), 1))
    length, _, _, _ = HEADER.unpack(received(connection, HEADER.size))
    if length == 0:
        return {}
    reply = plistlib.loads(received(connection, length))
    expect(isinstance(reply, dict), "the reply is not a dictionary")
    return dict(reply)


class RawClient:
    """Holds a log channel open without ever reading the messages."""

    def __init__(self, sandbox: Sandbox, name: str) -> None:
        self._listening = socket.socket(socket.AF_UNIX)
        self._listening.bind(str(sandbox.port(name)))
        self._listening.listen()
        with connect(sandbox.port()) as server:
            channel = call(server, {"CreateLogChannel": name})
        self._messages, _ = self._listening.accept()
        self._channel = connect(sandbox.port(channel["Port"]))

    def start_streaming(self) -> None:
        """Asks for messages."""
        self.send(frame(ONE_WAY, plistlib.dumps({"SetState": "Streaming"})))

    def send(self, data: bytes) -> None:
        """Sends bytes to the log channel; raises OSError if the service has closed it."""
        self._channel.sendall(data)

    def reconnect(self, port: Path) -> None:
        """Replaces the connection that the service has closed by one to that port."""
        self._channel.close()
        self._channel = connect(port)

    def close(self) -> None:
        """Closes all connections."""
        for each in (self._channel, self._messages, self._listening):
            each.close()
