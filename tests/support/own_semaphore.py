# SPDX-License-Identifier: Apache-2.0
"""A semaphore for the processes of one test, which nobody else uses and which does not outlive it."""
import ctypes
import os
import re

libc = ctypes.CDLL(None)
REMOVE = 0


class OwnSemaphore:
    def __enter__(self):
        self.key = os.getpid()  # no two processes of one machine have it at the same time
        return self

    def __exit__(self, *_):
        libc.semctl(libc.semget(self.key, 1, 0), 0, REMOVE)

    def put_into(self, properties):
        return re.sub(r"(?<=MPFileSemKey = )\d+", str(self.key), properties)
