"""What a person has at a desktop: windows, a keyboard, a screen, and a screen reader."""

import os
import subprocess
import time

import gi

gi.require_version("Atspi", "2.0")
gi.require_version("Gdk", "3.0")
import pyatspi  # noqa: E402
from gi.repository import Gdk  # noqa: E402


PATIENCE = 30  # seconds that a busy machine may take


def until(test, seconds, what):
    """Waits until the test answers something, and answers that."""
    end = time.monotonic() + seconds
    while True:
        found = test()
        if found:
            return found
        if time.monotonic() > end:
            raise AssertionError(f"{what}: not within {seconds} s")
        time.sleep(0.02)


def xdotool(*arguments):
    return subprocess.run(["xdotool", *arguments], capture_output=True, text=True, check=False).stdout


class Window:
    """The program with a file open."""

    def __init__(self, program, file, *arguments, log):
        self.log_path = log
        environment = dict(os.environ, QT_LINUX_ACCESSIBILITY_ALWAYS_ON="1", QT_QPA_PLATFORM="xcb")
        environment.pop("AT_SPI_BUS_ADDRESS", None)
        environment.setdefault("PULSE_SERVER", "unix:/nonexistent")
        # The desktop's own libraries leave memory behind when they end.
        environment["ASAN_OPTIONS"] = "detect_leaks=0"
        with open(log, "w") as out:
            self.process = subprocess.Popen([program, file, *arguments], env=environment, stdout=out, stderr=out)
        self.id = until(self._find, 60, "the window").split()[-1]
        xdotool("windowfocus", "--sync", self.id)

    def _find(self):
        if self.process.poll() is not None:
            raise AssertionError(f"the program ended with {self.process.returncode}: {self.log()}")
        return xdotool("search", "--onlyvisible", "--pid", str(self.process.pid))

    def log(self):
        with open(self.log_path, errors="replace") as log:
            return log.read()

    def is_running(self):
        return self.process.poll() is None

    def accessible(self):
        """Its canvas, as assistive technology meets it."""
        return until(self._canvas, 20, "the accessible window")

    def _canvas(self):
        for application in pyatspi.Registry.getDesktop(0):
            if application is not None and application.get_process_id() == self.process.pid:
                return pyatspi.findDescendant(application, lambda o: o.getRole() == pyatspi.ROLE_FILLER and o.name)
        return None

    def geometry(self):
        lines = xdotool("getwindowgeometry", "--shell", self.id).splitlines()
        values = dict(line.split("=") for line in lines if "=" in line)
        return [int(values[key]) for key in ("X", "Y", "WIDTH", "HEIGHT")]

    def picture(self):
        x, y, width, height = self.geometry()
        return Gdk.pixbuf_get_from_window(Gdk.get_default_root_window(), x, y, width, height)

    def title(self):
        return xdotool("getwindowname", self.id).strip()

    def end(self):
        if self.is_running():
            self.process.kill()
            self.process.wait()

    def close(self):
        """Closes it as a person does; answers the exit status."""
        xdotool("windowfocus", "--sync", self.id, "key", "Escape", "Escape", "ctrl+q")
        try:
            return self.process.wait(20)
        except subprocess.TimeoutExpired:
            self.process.kill()
            return "no end"


class ScreenReader:
    """Orca, which says what it has to say to a silent speech server."""

    def __init__(self, speech, socket, folder):
        self.speech = speech
        self.log = os.path.join(folder, "reader.log")
        environment = dict(os.environ, SPEECHD_ADDRESS="unix_socket:" + socket)
        environment.pop("AT_SPI_BUS_ADDRESS", None)
        environment["PATH"] = self._tools(folder) + os.pathsep + environment["PATH"]
        with open(self.log, "w") as out:
            self.process = subprocess.Popen(["orca"], env=environment, stdout=out, stderr=out)
        until(self._has_begun, 60, "the screen reader's first word")

    def _tools(self, folder):
        """It ends where it finds another of the same user; those of other desktops are none of its business."""
        tools = os.path.join(folder, "tools")
        os.mkdir(tools)
        os.symlink("/bin/false", os.path.join(tools, "pgrep"))
        return tools

    def _has_begun(self):
        if self.process.poll() is not None:
            with open(self.log) as log:
                raise AssertionError(f"the screen reader ended with {self.process.returncode}: {log.read()}")
        return self.speech.count()

    def rest(self, seconds=0.4, most=10):
        """Waits until nothing has been said for a while; answers how much was said so far."""
        end = time.monotonic() + most
        count, since = self.speech.count(), time.monotonic()
        while time.monotonic() - since < seconds and time.monotonic() < end:
            time.sleep(0.02)
            if self.speech.count() != count:
                count, since = self.speech.count(), time.monotonic()
        return count

    def meets(self, title, since):
        """Waits until it speaks of a window: then it is done with the keys of the one before."""
        heard = self.speech.wait_for(lambda texts: any(title in text for text in texts), since, 2 * PATIENCE)
        if not heard:
            raise AssertionError(f"\"{title}\" was not heard: {self.speech.said(since)[-20:]}")
        self.rest(1)

    def close(self):
        self.process.terminate()
        try:
            self.process.wait(10)
        except subprocess.TimeoutExpired:
            self.process.kill()
