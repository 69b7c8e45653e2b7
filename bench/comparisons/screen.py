"""A screen of its own on which programs are watched from outside, as a person sees them."""
import os
import subprocess
import time

from Xlib import X, XK, display
from Xlib.ext import xtest

SIZE = (1280, 900)


class Screen:
    """An X server without a monitor."""

    def __enter__(self):
        read_end, write_end = os.pipe()
        self.server = subprocess.Popen(
            ["Xvfb", "-displayfd", str(write_end), "-screen", "0", f"{SIZE[0]}x{SIZE[1]}x24", "-nolisten", "tcp"],
            pass_fds=[write_end], stderr=subprocess.DEVNULL)
        os.close(write_end)
        with os.fdopen(read_end) as answer:
            self.name = f":{answer.readline().strip()}"
        self.display = display.Display(self.name)
        self.root = self.display.screen().root
        return self

    def __exit__(self, *_):
        self.display.close()
        self.server.terminate()
        self.server.wait()

    def pixels(self, area):
        """The pixels of (x, y, width, height), four bytes each."""
        return self.root.get_image(*area, X.ZPixmap, 0xFFFFFFFF).data

    def window(self, least=(300, 200), size=None):
        """Place and size of the topmost window that is large enough; nothing without one. @param size  what it gets"""
        for child in reversed(self.root.query_tree().children):
            geometry = child.get_geometry()
            if child.get_attributes().map_state == X.IsViewable and geometry.width >= least[0] and \
                    geometry.height >= least[1]:
                child.set_input_focus(X.RevertToParent, X.CurrentTime)
                if size:
                    child.configure(x=0, y=0, width=size[0], height=size[1])
                    self.display.sync()
                    return 0, 0, *size
                return geometry.x, geometry.y, geometry.width, geometry.height
        return None

    def click(self, x, y, button=1):
        xtest.fake_input(self.display, X.MotionNotify, x=x, y=y)
        xtest.fake_input(self.display, X.ButtonPress, button)
        xtest.fake_input(self.display, X.ButtonRelease, button)
        self.display.sync()

    def key(self, name):
        code = self.display.keysym_to_keycode(XK.string_to_keysym(name))
        xtest.fake_input(self.display, X.KeyPress, code)
        xtest.fake_input(self.display, X.KeyRelease, code)
        self.display.flush()

    def picture(self, path):
        from PIL import Image  # only needed to look at the pictures
        Image.frombytes("RGB", SIZE, self.pixels((0, 0, *SIZE)), "raw", "BGRX").save(path)


def changed(before, after):
    """How much of two pictures of one size differs, from 0 to 1."""
    if before == after:
        return 0.0
    step = 4 * 7  # a sample of the pixels is enough
    pairs = zip(before[::step], after[::step])
    return sum(a != b for a, b in pairs) * step / len(before)


def until_quiet(screen, area, begin, quiet=1.5, most=60):
    """Seconds from `begin` to the last large change of an area that then stays as it is."""
    last = bytes(len(screen.pixels(area)))  # the empty screen is black
    last_change = None
    since = time.perf_counter()
    while time.perf_counter() - since < quiet or last_change is None:
        now = screen.pixels(area)
        if now != last:
            if changed(last, now) > 0.02:
                since = time.perf_counter()
                last_change = since
            last = now
        if time.perf_counter() - begin > most:
            return None
        time.sleep(0.002)
    return last_change - begin


def until_change(screen, area, before, begin, most=10):
    """Seconds from `begin` until an area differs from what it was; nothing when it stays."""
    while time.perf_counter() - begin < most:
        if screen.pixels(area) != before:
            return time.perf_counter() - begin
    return None
