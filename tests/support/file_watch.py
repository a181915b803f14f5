# SPDX-License-Identifier: Apache-2.0
"""Waiting for what other processes do to the files of a directory, without sleeping: inotify tells of
each change, and what is waited for is looked at again."""
import ctypes
import os
import select
import time

# Long enough for a machine that does a hundred other things; it passes only when a test fails.
DEADLINE_S = 60
CHANGES = 0x002 | 0x008 | 0x040 | 0x080 | 0x100 | 0x200  # modify, close_write, moved, create, delete

libc = ctypes.CDLL(None, use_errno=True)


class FileWatch:
    """Watches one directory, from the moment it is made on."""

    def __init__(self, directory):
        self.descriptor = libc.inotify_init1(os.O_CLOEXEC)
        if libc.inotify_add_watch(self.descriptor, os.fsencode(directory), CHANGES) < 0:
            raise OSError(ctypes.get_errno(), "inotify")

    def until(self, holds, what):
        """Waits until HOLDS() is true; fails with WHAT when the deadline has passed."""
        deadline = time.monotonic() + DEADLINE_S
        while not holds():
            rest = deadline - time.monotonic()
            if rest <= 0 or not select.select([self.descriptor], [], [], rest)[0]:
                raise AssertionError(f"not within {DEADLINE_S} s: {what()}")
            os.read(self.descriptor, 65536)
