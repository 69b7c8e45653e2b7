"""Commands timed as whole processes, in turn."""
import dataclasses
import os
import statistics
import subprocess
import sys
import time


@dataclasses.dataclass
class Command:
    """A program with its arguments; `input` is its standard input, `output` receives what it prints, `own_clock` is for one
    that prints its own seconds and peak kilobytes. One that runs longer than `most_seconds` is stopped, and counts as not
    finished."""
    name: str
    arguments: list
    output: str | None = None
    own_clock: bool = False
    environment: dict = dataclasses.field(default_factory=dict)
    most_seconds: float = 900
    ours: bool = False
    bound: bool = False  # no program for this work, but what the work can take at the least
    processor_time: bool = False  # seconds of the processor in the place of those of the clock
    input: str | None = None


@dataclasses.dataclass
class Result:
    """What the runs of one command came to."""
    name: str
    ours: bool = False
    bound: bool = False
    seconds: list = dataclasses.field(default_factory=list)
    peak_kb: int = 0
    note: str = ""

    @property
    def median(self):
        return statistics.median(self.seconds) if self.seconds else None


def run(command, folder):
    """Seconds and peak kilobytes of one run; nothing when it did not finish."""
    log = os.path.join(folder, "stderr.log")
    environment = {**os.environ, **command.environment}
    with open(command.output or os.devnull, "wb") as out, open(log, "wb") as err, \
            open(command.input or os.devnull, "rb") as given:
        begin = time.perf_counter()
        process = subprocess.Popen(command.arguments, cwd=folder, env=environment, stdin=given,
                                   stdout=subprocess.PIPE if command.own_clock else out, stderr=err,
                                   start_new_session=True)
        printed = process.stdout.read() if command.own_clock else b""
        status, usage = _wait(process, begin + command.most_seconds)
        seconds = time.perf_counter() - begin
    if status is None:
        return None
    if status != 0:
        with open(log, errors="replace") as file:
            sys.exit(f"{command.name}: {command.arguments} ended with {status}\n{file.read()[-2000:]}")
    if command.own_clock:
        own_seconds, own_peak = printed.split()
        return float(own_seconds), int(own_peak)
    return usage.ru_utime + usage.ru_stime if command.processor_time else seconds, usage.ru_maxrss


def _wait(process, deadline):
    """Status and resources of a process, or (None, None) for one that had to be stopped."""
    wait = 0.0002
    while True:
        pid, status, usage = os.wait4(process.pid, os.WNOHANG)
        if pid != 0:
            process.returncode = os.waitstatus_to_exitcode(status)
            return process.returncode, usage
        if time.perf_counter() > deadline:
            os.killpg(process.pid, 9)
            os.wait4(process.pid, 0)
            process.returncode = -9
            return None, None
        time.sleep(wait)
        wait = min(wait * 1.1, 0.005)


def in_turn(commands, folder, runs, slow=20):
    """Runs every command `runs` times, one after the other and again, after a first turn that only warms up. A command
    whose warm-up takes more than `slow` seconds is run once more. What a command has printed to its file is removed: memory
    holds it."""
    results = {command.name: Result(command.name, command.ours, command.bound) for command in commands}
    most = {command.name: runs for command in commands}
    for turn in range(runs + 1):
        for command in commands:
            result = results[command.name]
            if turn > most[command.name]:
                continue
            print(f"  {turn}/{runs} {command.name}", file=sys.stderr, flush=True)
            figures = run(command, folder)
            if command.output and os.path.exists(command.output):
                os.remove(command.output)
            if figures is None:
                result.note = f"stopped after {command.most_seconds:.0f} s"
                most[command.name] = 0
                continue
            if turn == 0 and figures[0] > slow:
                most[command.name] = 1
            if turn > 0:
                result.seconds.append(figures[0])
                result.peak_kb = max(result.peak_kb, figures[1])
    return list(results.values())
