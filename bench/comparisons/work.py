"""What a comparison is, and where its programs are."""
import dataclasses
import multiprocessing
import os
import tempfile


@dataclasses.dataclass
class Limit:
    """What a figure may be at most. @param figure  nothing where it could not be had"""
    what: str
    figure: float | None
    most: float
    unit: str = ""

    @property
    def kept(self):
        return self.figure is not None and self.figure <= self.most


@dataclasses.dataclass
class Comparison:
    """One piece of work done by several programs: its results, and the limits that are judged by them."""
    key: str
    title: str
    about: str
    results: list
    limits: list
    axis: str = "seconds"
    extra: list = dataclasses.field(default_factory=list)  # lines below the table
    parts: list = dataclasses.field(default_factory=list)  # rows of micro benchmarks instead of all of this


class Surroundings:
    """The programs that were built, and a folder in memory where there is one, so that the disk does not count."""

    def __init__(self, build, runs, quick):
        self.build = os.path.abspath(build)
        self.runs = runs
        self.quick = quick
        self.kareport = f"{self.build}/bin/kareport"
        self.desk = f"{self.build}/bin/kareport-desk"
        self.bench = f"{self.build}/bench"

    def size(self, whole, quick):
        return quick if self.quick else whole

    def folder(self):
        where = "/dev/shm" if os.access("/dev/shm", os.W_OK) else None
        return tempfile.TemporaryDirectory(dir=where, prefix="kareport-compare-")


def make(function, *arguments):
    """Makes files in a process of its own: a command that is started shows at least the memory of what started it."""
    maker = multiprocessing.Process(target=function, args=arguments)
    maker.start()
    maker.join()
    if maker.exitcode != 0:
        raise SystemExit(f"{function.__name__} failed")


def share(results, ours):
    """How much of our time is what the work takes at the least."""
    own = next(result.median for result in results if result.name == ours)
    bound = next(result for result in results if result.bound)
    return f"{bound.median / own:.0%} of our time is {bound.name}." if own and bound.median else ""


def ratio(results, ours, others=None):
    """Our median over the fastest of the others; nothing when either is missing."""
    own = next((result.median for result in results if result.name == ours), None)
    rest = [result.median for result in results
            if result.median is not None and not result.ours and not result.bound and
            (others is None or result.name in others)]
    return own / min(rest) if own is not None and rest else None
