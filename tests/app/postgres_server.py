"""A PostgreSQL server of a test's own, in a temporary folder, on a socket there."""

import glob
import os
import pathlib
import pwd
import shutil
import signal
import subprocess
import tempfile
import time


def lives(process):
    """Not a dead one that nobody has asked for yet."""
    try:
        return ") Z " not in pathlib.Path(f"/proc/{process}/stat").read_text()
    except OSError:
        return False


class Postgres:
    """Use it in a with statement. It can be killed, and started again."""

    def __init__(self):
        self.folder = tempfile.mkdtemp(prefix="line.")
        self.programs = sorted(glob.glob("/usr/lib/postgresql/*/bin"))[-1]
        # It refuses to run as root.
        self.user = {"user": pwd.getpwnam("postgres").pw_name, "group": "postgres"} if os.geteuid() == 0 else {}
        if self.user:
            shutil.chown(self.folder, **self.user)
        self.data = self.folder + "/data"
        self.url = f"postgresql:///postgres?host={self.folder}&user=owner"
        self.server = None

    def __enter__(self):
        self.program("initdb", "--pgdata", self.data, "--username", "owner", "--auth", "trust", "--encoding", "UTF8",
                     "--no-sync")
        self.start()
        return self

    def __exit__(self, *_):
        self.kill()
        shutil.rmtree(self.folder)

    def program(self, name, *arguments):
        subprocess.run([f"{self.programs}/{name}", *arguments], check=True, stdout=subprocess.DEVNULL,
                       cwd=self.folder, **self.user)

    def start(self):
        """Returns when it answers."""
        log = open(self.folder + "/log", "a")
        self.server = subprocess.Popen(
            [f"{self.programs}/postgres", "-D", self.data, "-k", self.folder, "-c", "listen_addresses=",
             "-c", "fsync=off"],  # processes are killed here, not machines
            stdout=log, stderr=log, cwd=self.folder, start_new_session=True, **self.user)
        log.close()
        while subprocess.run([f"{self.programs}/pg_isready", "--quiet", "--host", self.folder, "--timeout", "30"],
                             check=False).returncode != 0:
            if self.server.poll() is not None:
                raise RuntimeError(open(self.folder + "/log").read())

    def kill(self):
        """As a power cut does: all of its processes at once. While one of them is left no server starts again."""
        self.server.send_signal(signal.SIGSTOP)  # it starts no more
        server = self.server.pid
        processes = [server, *map(int, pathlib.Path(f"/proc/{server}/task/{server}/children").read_text().split())]
        for process in processes:
            os.kill(process, signal.SIGKILL)
        self.server.wait()
        while any(map(lives, processes)):
            time.sleep(0.01)

    def ask(self, sql):
        """The rows, as lists of texts."""
        out = subprocess.run([f"{self.programs}/psql", self.url, "--no-psqlrc", "--tuples-only", "--no-align",
                              "--field-separator=\t", "--command", sql], check=True, capture_output=True, text=True)
        return [line.split("\t") for line in out.stdout.splitlines()]
