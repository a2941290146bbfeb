"""A sound device that nobody hears, and what comes out of it."""

import array
import os
import statistics
import subprocess
import threading
import time

RATE = 48000
LOWEST, HIGHEST = 200, 1400  # hertz, of the ends of a vertical axis
SOFT = 200  # of 32,767: what is quieter counts as silence
BETWEEN = RATE * 3 // 10  # frames of silence that part two notes; a busy machine breaks one up


def pitch_of(value, minimum, maximum):
    return LOWEST * (HIGHEST / LOWEST) ** ((value - minimum) / (maximum - minimum))


def pitch(samples):
    """By where the wave comes up through zero, in hertz; the soft ends left out."""
    middle = samples[len(samples) // 5 : -len(samples) // 5]
    rises = [i + a / (a - b) for i, (a, b) in enumerate(zip(middle, middle[1:])) if a < 0 <= b]
    periods = [after - before for before, after in zip(rises, rises[1:])]
    return RATE / statistics.median(periods) if periods else None


class Device:
    """A sound server of its own, whose only output is recorded. While it is there, programs find it."""

    def __init__(self, folder):
        self._socket = os.path.join(folder, "sound")
        self._samples, self._read = array.array("h"), 0

    def __enter__(self):
        modules = [f"module-native-protocol-unix socket={self._socket} auth-anonymous=1", "module-null-sink"]
        command = ["pulseaudio", "-n", "--daemonize=no", "--exit-idle-time=-1", "--disallow-exit=yes"]
        quiet = {"stdout": subprocess.DEVNULL, "stderr": subprocess.DEVNULL}
        self._server = subprocess.Popen([*command, *(f"--load={module}" for module in modules)], **quiet)
        end = time.monotonic() + 30
        while not os.path.exists(self._socket) and time.monotonic() < end:
            time.sleep(0.05)
        os.environ["PULSE_SERVER"] = "unix:" + self._socket
        record = ["parec", "--device=null.monitor", "--format=s16le", f"--rate={RATE}", "--channels=1"]
        self._recorder = subprocess.Popen([*record, "--latency-msec=20"], stdout=subprocess.PIPE)
        threading.Thread(target=self._listen, daemon=True).start()
        return self

    def __exit__(self, *_):
        del os.environ["PULSE_SERVER"]
        for process in (self._recorder, self._server):
            process.terminate()
            process.wait(10)

    def _listen(self):
        while data := self._recorder.stdout.read(1920):
            self._samples.frombytes(data)

    def next_pitch(self, seconds):
        """Of the next note, once it has ended; None where there is none in time."""
        end = time.monotonic() + seconds
        while time.monotonic() < end:
            note = self._next_note()
            if note:
                return pitch(note)
            time.sleep(0.05)
        return None

    def _next_note(self):
        heard = self._samples[self._read :]
        loud = [i for i, sample in enumerate(heard) if abs(sample) > SOFT]
        if not loud:
            return None
        for last, following in zip(loud, [*loud[1:], len(heard)]):
            if following - last > BETWEEN:
                self._read += last + 1
                return heard[loud[0] : last + 1]
        return None
