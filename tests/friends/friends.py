# SPDX-License-Identifier: Apache-2.0
"""What the tests of programs around a log file share: the snippets, and somebody who logs. Whoever
imports it finds what lies in tests/support too."""
import os
import pathlib
import shutil
import subprocess
import sys

sys.path.insert(0, str(pathlib.Path(__file__).resolve().parents[1] / "support"))


def program(name):
    """The path of a program, which may be one of those that only administrators have in theirs."""
    found = shutil.which(name, path=os.environ["PATH"] + ":/usr/sbin:/sbin")
    assert found, f"{name} is not installed; see scripts/debian-packages"
    return found


def put_snippet(path, directory, name, changes, before=""):
    """Writes a snippet with the paths of a test, and with CHANGES such as "this -> that"."""
    text = pathlib.Path(path).read_text(encoding="utf-8")
    for change in changes:
        old, new = change.split(" -> ")
        assert old in text, f"the snippet has no {old}"
        text = text.replace(old, new)
    copy = directory / name
    copy.write_text(before + text.replace("/var/log/example", str(directory)), encoding="utf-8")
    copy.chmod(0o644)  # some programs refuse settings that others may write
    return copy


class Writer:
    """A process that logs numbered records to a file, each when it is told to."""

    def __init__(self, writer, directory, properties):
        path = directory / "writer.properties"
        path.write_text(
            "friend.log.className = zlv_basiclogger\n"
            "friend.log.listenerNames = friend.file\n"
            f"{properties}\n", encoding="utf-8")
        self.process = subprocess.Popen(
            [writer, path], stdin=subprocess.PIPE, stdout=subprocess.PIPE, text=True)
        self.count = 0

    def __enter__(self):
        return self

    def __exit__(self, *_):
        self.process.communicate()

    def log(self, count):
        """Logs the next COUNT records; they stand in the file on return."""
        for _ in range(count):
            print(f"r{self.count:04}", file=self.process.stdin, flush=True)
            answer = self.process.stdout.readline()
            assert answer == "0\n", f"record {self.count}: {answer}"
            self.count += 1
