# SPDX-License-Identifier: Apache-2.0
"""What the tables of the benchmarks show: which figure over which, and how large it may be."""
from dataclasses import dataclass


@dataclass
class Row:
    what: str
    measured: str  # "topic/benchmark"
    floor: str  # what it is measured against
    limit: float | None = None
    aim: float | None = None
    times: float = 1  # so many floors
    records: int = 0  # in one measured run, where records per second are of interest


def peer(topic, name, limit=None, aim=None, ours="zelvo", theirs=None):
    theirs = theirs or topic
    return Row(f"{name}", f"{topic}/{ours}", f"{topic}/{theirs}", limit, aim)


def refusal(topic, name):
    return Row(f"refused call / {name}", f"{topic}/zelvo refused", f"{topic}/{topic} refused")


def against_floor(name, kind, limit=None, aim=None):
    return Row(name, f"records/{kind}", f"records/floor of {kind}", limit, aim)


SECTIONS = {
    "Refused calls, against a call of an empty function": [
        Row("a call", "refused/refused", "refused/empty call", 3.0, 2.0),
        Row("the test in the header", "refused/refused inline", "refused/empty call", 1.5, 1.0),
        Row("a call in C++", "refused/refused in C++", "refused/empty call"),
    ],
    "Records, against their system calls": [
        against_floor("line", "line", 1.6, 1.25),
        against_floor("line from a bundle, English", "localised en", 1.8, 1.3),
        against_floor("line from a bundle, German", "localised de", 1.8, 1.3),
        against_floor("line with file, function and line number", "debug"),
        against_floor("XML record", "xml", 3.0, 2.0),
        against_floor("trace line", "trace", 2.0, 1.5),
        Row("line to a shared file", "shared/shared", "shared/floor of shared", 1.5, 1.2),
        Row("C++ line record / C line record", "records/line in C++", "records/line"),
        Row("for comparison: line, against its own calls", "records/line", "records/own calls"),
        Row("for comparison: the write alone", "records/write", "records/floor of line"),
    ],
    "Peers": [
        peer("spdlog", "line / spdlog with a stat for each record", 1.2, 1.0,
             theirs="spdlog with stat"),
        peer("spdlog", "line / spdlog"),
        peer("log4cplus", "line / log4cplus", 1.3, 1.0),
        peer("log4cplus", "shared file / log4cplus with lock file", 0.9, 0.7,
             ours="zelvo shared", theirs="log4cplus with lock file"),
        peer("log4cxx", "line / log4cxx", 0.9, 0.7),
        peer("boost", "line / Boost.Log", 0.9, 0.7),
        peer("glog", "line / glog", 0.9, 0.7),
        *(refusal(topic, name) for topic, name in
          (("spdlog", "spdlog"), ("log4cplus", "log4cplus"), ("log4cxx", "log4cxx"),
           ("boost", "Boost.Log"), ("glog", "glog, VLOG"))),
        Row("refused call / glog, LOG below minloglevel", "glog/zelvo refused",
            "glog/glog refused late"),
    ],
    "Handlers of one logger, against as many times the system calls": [
        Row(f"{count} file{'s' * (count > 1)}", f"trees/fan-out {count}", "trees/floor", times=count)
        for count in (1, 2, 4, 8)],
    "Threads at one logger, against one thread": [
        Row(f"{count} thread{'s' * (count > 1)}", f"trees/threads {count}", "trees/threads 1",
            records=1)
        for count in (1, 2, 4)],
    "Processes at one shared file, against one process; cost of 5,000 records each": [
        Row(f"{count} process{'es' * (count > 1)}", f"processes/processes {count}",
            "processes/processes 1", times=count, records=5000 * count)
        for count in (1, 2, 4)],
    "Configured objects, against as many times the cost of 100": [
        *(Row(f"open a file that describes {count:,}", f"scale/open {count}", "scale/open 100",
              times=count / 100) for count in (100, 1000, 10000)),
        *(Row(f"make all {count:,} of them", f"scale/make {count}", "scale/make 100",
              times=count / 100) for count in (100, 1000, 10000)),
    ],
    "One configured object, against one among 100": [
        Row(f"look it up among {count:,}", f"scale/look up {count}", "scale/look up 100")
        for count in (100, 1000, 10000)],
}

ALLOCATIONS = {
    "allocations/line": "line",
    "allocations/localised en": "line from a bundle, English",
    "allocations/localised de": "line from a bundle, German",
    "allocations/debug": "line with file, function and line number",
    "allocations/xml": "XML record",
    "allocations/trace": "trace line",
    "allocations/shared": "line to a shared file",
}

# What each peer does for a record, so that the ratios can be read.
LEGEND = {
    "spdlog": "spdlog: one write(); does not notice that its file was deleted or moved. With a "
              "stat() before each record it could, as this toolkit's handler does.",
    "log4cplus": "log4cplus: one write(); does not notice a deleted file. With a lock file: "
                 "fcntl(), lseek(), write(), fcntl().",
    "log4cxx": "log4cxx: one write(); does not notice a deleted file.",
    "boost": "Boost.Log: one write(); does not notice a deleted file.",
    "glog": "glog: gettid(), getpid(), one write(), and a stat() of /etc/localtime while TZ is not "
            "set; does not notice a deleted file. LOG() below minloglevel makes its text before it "
            "drops it; VLOG() does not.",
}
