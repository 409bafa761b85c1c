"""Clients that mean harm to an application whose screen is served: attack_test.py PROGRAM [sanitizer]

A sanitizer keeps what is freed: memory is not judged then. An honest viewer sees the screen all the while.
"""

import os
import pathlib
import re
import select
import socket
import struct
import subprocess
import sys
import time
import unittest

PROGRAM = sys.argv.pop(1)
JUDGES_MEMORY = sys.argv[1:] != ["sanitizer"]
MOST_CONNECTIONS = 64
MOST_VIEWERS = 16
FEW = 8  # connections that are just about to end, or to begin
PAUSE = 0.25  # seconds after a wrong password


class Application:
    def __init__(self):
        settings = {**os.environ, "BRIMOL_DISPLAY": "browser", "BRIMOL_LISTEN": "127.0.0.1:0"}
        self.process = subprocess.Popen([PROGRAM], stderr=subprocess.PIPE, text=True, env=settings)
        self.folder = pathlib.Path(f"/proc/{self.process.pid}")
        said = self.process.stderr.readline() + self.process.stderr.readline()
        self.web, self.vnc, self.password = re.search(
            r"http://127.0.0.1:(\d+)/.*\n.*127.0.0.1::(\d+), password (\S+)", said).groups()

    def figures(self):
        """Threads, descriptors, and memory in MiB."""
        return len(list((self.folder / "task").iterdir())), self.descriptors(), self.memory("VmRSS")

    def descriptors(self):
        return len(list((self.folder / "fd").iterdir()))

    def memory(self, name):
        return int(re.search(name + r":\s+(\d+)", (self.folder / "status").read_text()).group(1)) >> 10

    def forget_peak(self):
        """VmHWM, the most memory that it had, counts from here on."""
        (self.folder / "clear_refs").write_text("5")

    def end(self):
        self.process.kill()
        self.process.communicate()


def connect(port, said=b""):
    connection = socket.create_connection(("127.0.0.1", int(port)), timeout=60)
    connection.sendall(said)
    return connection


def read(connection, count):
    """That many bytes; fewer where the connection ends."""
    got = b""
    try:
        while len(got) < count and (more := connection.recv(count - len(got))):
            got += more
    except ConnectionError:
        pass
    return got


def has_ended(connection):
    """Whether the other side has ended it; what it sent before is read."""
    try:
        while select.select([connection], [], [], 0)[0]:
            if not connection.recv(1 << 16):
                return True
    except ConnectionError:
        return True
    return False


class Websocket:
    """A connection, once it is upgraded, as a viewer's."""

    def __init__(self, connection):
        self.connection, self.came = connection, b""

    def sendall(self, message):
        self.connection.sendall(bytes([0x82, 0x80 | len(message)]) + bytes(4) + message)  # masked with zeros

    def recv(self, count):
        while not self.came:
            kind, length = read(self.connection, 2)
            if length > 125:
                length = int.from_bytes(read(self.connection, 2 if length == 126 else 8), "big")
            message = read(self.connection, length)
            self.came = message if kind & 15 <= 2 else b""
        taken, self.came = self.came[:count], self.came[count:]
        return taken


def cipher(password, challenge):
    """VNC's: each byte of the key the other way round."""
    key = "".join(f"{int(f'{byte:08b}'[::-1], 2):02x}" for byte in password.encode().ljust(8, b"\0"))
    command = ["openssl", "enc", "-des-ecb", "-K", key, "-nopad", "-provider", "legacy", "-provider", "default"]
    return subprocess.run(command, input=challenge, stdout=subprocess.PIPE, check=True).stdout


def is_let_in(connection, password):
    connection.sendall(b"RFB 003.008\n\2")
    challenge = read(connection, 12 + 2 + 16)[14:]
    if len(challenge) != 16:
        return False
    connection.sendall(cipher(password, challenge) + b"\1")
    return read(connection, 4) == bytes(4) and len(read(connection, 24)) == 24


def viewer(application, password=None):
    """A viewer that was let in, or None."""
    connection = connect(application.vnc)
    if is_let_in(connection, password or application.password):
        return connection
    read(connection, 999)  # to its end, with which the pause begins
    connection.close()
    return None


def ask_for_picture(connection):
    connection.sendall(struct.pack(">BBHHHH", 3, 0, 0, 0, 2000, 4000))


class AttackTest(unittest.TestCase):
    @classmethod
    def setUpClass(cls):
        cls.application = Application()
        cls.addClassCleanup(cls.application.end)
        cls.opened = []
        cls.before = None

    def setUp(self):
        self.honest = self.comes_in()
        self.assertTrue(self.is_served(self.honest))
        if self.before is None:
            type(self).before = self.settled_figures()

    def settled_figures(self):
        """Once they have been the same for a while: a viewer's threads and pipes come after its first picture."""
        looks = [self.application.figures()]
        while len(looks) < 6 or any(look[:2] != looks[-1][:2] for look in looks[-6:]):
            time.sleep(0.5)
            looks.append(self.application.figures())
        return looks[-1]

    def tearDown(self):
        self.assertTrue(self.is_served(self.honest), "the honest viewer is held up")
        for connection in [*self.opened, self.honest]:
            connection.close()
        self.opened.clear()

    def is_served(self, connection):
        connection.sendall(struct.pack(">BBHHHH", 3, 0, 0, 0, 1, 1))
        return len(read(connection, 20)) == 20  # one part of one pixel

    def comes_in(self):
        """An honest viewer, who tries again as the page does."""
        for _ in range(60):
            if connection := viewer(self.application):
                read(connection, 6)  # the screen's name
                return connection
            time.sleep(0.5)
        self.fail("an honest viewer is kept out")

    def open(self, *arguments):
        self.opened.append(connect(*arguments))
        return self.opened[-1]

    def assert_ends(self, connection):
        """Not by the time limit, which is for those who have not proved the password."""
        try:
            while connection.recv(1 << 16):
                pass
        except ConnectionError:
            pass
        except TimeoutError:
            self.fail("the connection stays open")

    def test_who_asks_again_and_again_or_byte_by_byte_or_nothing_has_to_go(self):
        slow = [self.open(port) for port in (self.application.web, self.application.vnc)]
        asking, dripping = self.open(self.application.web), self.open(self.application.web)
        request = b"GET /x HTTP/1.1\r\nHost: localhost\r\n\r\n"
        for byte in b"GET / HTTP/1.1\r\nA: " + 50 * b"a":
            try:
                if not has_ended(asking):
                    asking.sendall(request)
                if not has_ended(dripping):
                    dripping.sendall(bytes([byte]))
            except ConnectionError:
                pass
            if all(map(has_ended, [asking, dripping, *slow])):
                return
            time.sleep(0.5)
        self.fail("one stays")

    def test_many_without_the_password_leave_room_for_one_with_it(self):
        for _ in range(3 * MOST_CONNECTIONS):
            self.open(self.application.web, b"GET / HTTP/1.1\r\n")
        self.opened[-1].sendall(b"Host: localhost\r\n\r\n")
        self.assertIn(b"200", read(self.opened[-1], 15))  # so the listener has come to all of them
        self.assertLess(self.application.descriptors(), self.before[1] + MOST_CONNECTIONS + FEW)
        self.comes_in().close()
        # Those that the listener has not come to yet count as open, too.
        end = time.monotonic() + 60
        while len([each for each in self.opened if not has_ended(each)]) > MOST_CONNECTIONS:
            self.assertLess(time.monotonic(), end, "too many stay")
            time.sleep(0.1)

    def test_viewers_are_sixteen_and_go_where_they_read_nothing(self):
        for _ in range(MOST_VIEWERS - 1):
            self.opened.append(self.comes_in())
            self.assertTrue(self.is_served(self.opened[-1]))
        self.assertEqual(read(self.open(self.application.vnc), 12), b"", "one more than there is room for")
        for connection in self.opened[:-1]:
            ask_for_picture(connection)
            ask_for_picture(connection)
        self.comes_in().close()

    def test_wrong_passwords_make_a_pause(self):
        tries = 8
        begin = time.monotonic()
        for _ in range(tries):
            self.assertIsNone(viewer(self.application, "wrong"))
        self.assertGreaterEqual(time.monotonic() - begin, (tries - 1) * PAUSE)

    def upgraded(self, origin):
        """A websocket's connection, and the first line of what it was answered."""
        own = f"localhost:{self.application.web}"
        connection = self.open(self.application.web, (
            f"GET / HTTP/1.1\r\nHost: {own}\r\nOrigin: http://{origin or own}\r\nUpgrade: websocket\r\n"
            "Connection: Upgrade\r\nSec-WebSocket-Version: 13\r\n"
            "Sec-WebSocket-Key: AAAAAAAAAAAAAAAAAAAAAA==\r\n\r\n").encode())
        said = read(connection, 12)
        while b"101" in said and not said.endswith(b"\r\n\r\n"):
            said += read(connection, 1)
        return connection, said

    def test_websockets_of_other_origins_and_broken_ones(self):
        self.assertNotIn(b"101", self.upgraded("evil.example")[1])
        for message in (b"\x82\x05hello",  # not masked, as a browser's are
                        b"\x82\xff\x7f\xff\xff\xff\xff\xff\xff\xff\0\0\0\0a",  # of 2^63 bytes
                        b"\xf3\x80\0\0\0\0",  # of an unknown kind
                        bytes(range(256)) * 16):
            connection, said = self.upgraded(None)
            self.assertIn(b"101", said)
            self.assertTrue(is_let_in(Websocket(connection), self.application.password))
            connection.sendall(message)
            self.assert_ends(connection)

    def test_a_version_that_only_looks_like_a_number_does_not_come_to_the_server(self):
        """It would wait for the rest of the password, in the thread that serves all viewers."""
        for version in b"RFB 003.00A\n", b"RFB 003. 08\n", b"RFB 003.0x8\n", b"RFB 003.-01\n":
            said = read(self.open(self.application.vnc, version + b"\2"), 99)
            self.assertIn(said, (b"", b"RFB 003.008\n"), "the server's answer")

    def test_huge_and_broken_messages_end_the_connection(self):
        huge = self.open(self.application.web)
        try:
            huge.sendall(b"GET / HTTP/1.1\r\nHost: localhost\r\n" + 40000 * b"A: aaaaaaaaaaaaaaaaaaaaa\r\n" + b"\r\n")
        except ConnectionError:
            pass
        self.assertNotIn(b"200", read(huge, 99))
        for message in b"\2\0\xff\xff", b"\x80", b"\xc7":  # too many encodings, and unknown kinds
            self.opened.append(self.comes_in())
            self.opened[-1].sendall(message)
            self.assert_ends(self.opened[-1])
        clipboard = self.comes_in()
        self.opened.append(clipboard)
        self.application.forget_peak()
        before = self.application.memory("VmHWM")
        clipboard.sendall(b"\6\0\0\0" + struct.pack(">I", 32 << 20) + (32 << 20) * b"a")
        self.assertTrue(self.is_served(clipboard))
        if JUDGES_MEMORY:
            self.assertLess(self.application.memory("VmHWM"), before + 8, "MiB of memory, of a text of 32")

    def test_z_it_is_as_it_was(self):
        for _ in range(60):
            now = self.application.figures()
            if now[:2] == self.before[:2]:
                break
            time.sleep(0.5)
        self.assertEqual(now[:2], self.before[:2], "threads and descriptors")
        if JUDGES_MEMORY:
            self.assertLess(now[2], self.before[2] + 64, "MiB of memory")  # less than five pictures of the screen


if __name__ == "__main__":
    unittest.main(argv=sys.argv[:1])
