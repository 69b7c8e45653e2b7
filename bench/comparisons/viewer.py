"""A long report in a window: opened to shown, and a key pressed in its middle."""
import os
import statistics
import subprocess
import tempfile
import time

from measure import Result
from pages import lines
from screen import Screen, until_change, until_quiet
from work import Comparison, Limit, make, ratio

KEYS = 30
SIZE = (700, 500)  # of every window while keys are pressed: what is painted counts
SCROLL_BAR = 8  # pixels from the right edge of the window to the middle of its scroll bar


def make_files(folder, count):
    with open(f"{folder}/report.rep", "wb") as report, open(f"{folder}/report.txt", "w") as text:
        report.write(b"\xef\xbb\xbf")
        for line in lines(count):
            report.write(f"{line}\r\r\n".encode())
            text.write(line + "\n")


class Watched:
    """A program in its window."""

    def __init__(self, screen, folder, arguments):
        # A home of its own: what a program that was ended like this asks at its next start is nothing to measure.
        home = tempfile.mkdtemp(dir=folder)
        environment = {**os.environ, "DISPLAY": screen.name, "HOME": home, "QT_QPA_PLATFORM": "xcb",
                       "XDG_CONFIG_HOME": home, "XDG_DATA_HOME": home, "XDG_RUNTIME_DIR": home}
        self.screen = screen
        self.begin = time.perf_counter()
        self.process = subprocess.Popen(arguments, cwd=folder, env=environment, stdin=subprocess.DEVNULL,
                                        stdout=subprocess.DEVNULL, stderr=subprocess.DEVNULL)

    def shown(self):
        """Seconds from the start until the text is in the window."""
        while (window := self.screen.window()) is None:
            if time.perf_counter() - self.begin > 60 or self.process.poll() is not None:
                return None
            time.sleep(0.002)
        self.x, self.y, self.width, self.height = window
        return until_quiet(self.screen, self.strip(), self.begin)

    def strip(self):
        """A part of the window that the text's lines run through."""
        return (self.x + self.width // 3, self.y + self.height // 2 - 60, 120, 160)

    def key(self):
        """Median of the seconds from a key in the middle of the text until the line has moved."""
        self.x, self.y, self.width, self.height = self.screen.window(size=SIZE)
        time.sleep(1.0)
        self.screen.click(self.x + self.width - SCROLL_BAR, self.y + self.height // 2, 2)
        time.sleep(1.0)
        left, row = self.x + 120, self.y + self.height // 2
        self.screen.click(left, row)
        time.sleep(1.0)
        # Right of the cursor, whose blinking would count as a change.
        area = (left + 60, row - 4, 160, 8)
        seconds = []
        for turn in range(KEYS):
            before = self.screen.pixels(area)
            begin = time.perf_counter()
            self.screen.key("xy"[turn % 2])  # no two pictures alike
            seconds.append(until_change(self.screen, area, before, begin))
            self.screen.key("Left")  # the cursor stays outside of the area
            time.sleep(0.2)
        # The first key in a new place prepares more than the others do.
        return statistics.median(seconds[1:]) if all(seconds) else None

    def close(self):
        self.process.kill()
        _, _, usage = os.wait4(self.process.pid, 0)
        self.process.returncode = 0
        return usage.ru_maxrss


def run(surroundings):
    count = surroundings.size(300_000, 20_000)
    with surroundings.folder() as folder, Screen() as screen:
        make(make_files, folder, count)
        commands = {
            "kareport-desk": [surroundings.desk, f"{folder}/report.rep"],
            "bare QPlainTextEdit": [f"{surroundings.bench}/ka_bare_view", f"{folder}/report.txt"],
            "FeatherPad": ["featherpad", "--standalone", f"{folder}/report.txt"],
        }
        shown = {name: Result(name, name == "kareport-desk") for name in commands}
        keys = {name: Result(name, name == "kareport-desk") for name in commands}
        for turn in range(surroundings.runs + 1):
            for name, arguments in commands.items():
                print(f"  {turn}/{surroundings.runs} {name}", flush=True)
                watched = Watched(screen, folder, arguments)
                seconds = watched.shown()
                key = watched.key() if seconds is not None else None
                if os.environ.get("KAREPORT_COMPARE_PICTURES"):
                    screen.picture(f"{os.environ['KAREPORT_COMPARE_PICTURES']}/{name}.png")
                peak = watched.close()
                if turn > 0 and seconds is not None:
                    shown[name].seconds.append(seconds)
                    shown[name].peak_kb = max(shown[name].peak_kb, peak)
                if turn > 0 and key is not None:
                    keys[name].seconds.append(key)
    bare, editor = ["bare QPlainTextEdit"], ["FeatherPad"]
    shown, keys = list(shown.values()), list(keys.values())
    how = ("Watched from outside on a screen of its own: the time is that at which the pixels change, looked at every "
           "few milliseconds.")
    return [
        Comparison("viewer-shown", f"{count:,} lines in a window, from the program's start to the text shown",
                   f"A report of {count:,} lines of 80 characters. " + how, shown,
                   [Limit("time, of the bare control", ratio(shown, "kareport-desk", bare), 1.2),
                    Limit("time, of the editor", ratio(shown, "kareport-desk", editor), 1.0)]),
        Comparison("viewer-key", f"A key pressed in the middle of {count:,} lines, to the line moved",
                   "The same windows in one size, scrolled to their middle. " + how, keys,
                   [Limit("time, of the bare control", ratio(keys, "kareport-desk", bare), 1.2),
                    Limit("time, of the editor", ratio(keys, "kareport-desk", editor), 1.0)]),
    ]
