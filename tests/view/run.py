#!/usr/bin/python3
"""Opens each sample in the window, as a person with a screen reader does, and checks what they meet.

    tests/view/private-desktop tests/view/run.py BUILD-FOLDER [PICTURE-FOLDER] [SAMPLE...]
"""

import glob
import json
import os
import statistics
import subprocess
import sys
import tempfile
import time

import acting
import checks
from desktop import ScreenReader, Window
from silent_speech import SilentSpeech

TOP = os.path.dirname(os.path.dirname(os.path.dirname(os.path.abspath(__file__))))
SEED = 20260308
MOST_SECONDS = 0.3  # from a key to speech


class Run:
    def __init__(self, build, pictures):
        self.bin = os.path.join(build, "bin")
        self.samples = os.path.join(TOP, "samples")
        self.pictures = pictures
        self.folder = tempfile.mkdtemp()
        self.faults, self.delays = [], []
        speech = SilentSpeech(os.path.join(self.folder, "speech"))
        self.reader = ScreenReader(speech, os.path.join(self.folder, "speech"), self.folder)

    def output(self, command, file, *more):
        program = os.path.join(self.bin, "axvelto")
        environment = dict(os.environ, ASAN_OPTIONS="detect_leaks=0")
        return subprocess.run(
            [program, command, file, *more], capture_output=True, text=True, check=True, env=environment
        ).stdout

    def open(self, file, *more):
        return Window(os.path.join(self.bin, "axvelto-view"), file, *more, log=os.path.join(self.folder, "window.log"))

    def picture(self, window, name):
        return checks.picture(window, os.path.join(self.pictures, f"{name}.png"))

    def note(self, file, faults):
        for fault in faults:
            self.faults.append(f"{file}: {fault}")
            print(f"  {file}: {fault}", flush=True)

    def sample(self, file, language, locale):
        name = os.path.basename(file).rsplit(".", 1)[0]
        opened = self.reader.rest(1)  # it still tells of keys that the last window was given
        window = self.open(file, "--locale", locale)
        try:
            self.reader.meets(window.title(), opened)
            document = json.loads(self.output("tree", file, "--locale", locale))
            charts = json.loads(self.output("graph", file, "--json", "--locale", locale))
            self.note(file, checks.tree(window, document, charts, language))
            self.note(file, self.picture(window, f"{name}-{language}"))
            if language == "en":
                for fault, delays in checks.reading(opened, self.reader, self.output("speak", file).splitlines()):
                    self.note(file, [fault] if fault else [])
                    self.delays += delays or []
            self.note(file, checks.random_keys(window, f"{SEED} {name} {language}"))
        finally:
            window.end()

    def finish(self):
        self.reader.close()
        if self.delays:
            nearly_all = sorted(self.delays)[int(len(self.delays) * 0.95)]
            print(
                f"from a key to speech: median {statistics.median(self.delays):.2f} s, 19 of 20 within "
                f"{nearly_all:.2f} s, longest {max(self.delays):.2f} s, {len(self.delays)} keys"
            )
            if nearly_all > MOST_SECONDS:
                print(f"the machine is busy, or speech comes later than {MOST_SECONDS} s after a key")
        print(f"the window: {len(self.faults)} faults")
        return 1 if self.faults else 0


def main(build, pictures, *only):
    files = only or sorted(glob.glob(f"{TOP}/samples/*.json") + glob.glob(f"{TOP}/samples/workouts/*.*"))
    os.makedirs(pictures, exist_ok=True)
    run = Run(build, pictures)
    for file in files:
        for language, locale in (("en", "en_US"), ("ar", "ar_SA")):
            start = time.monotonic()
            try:
                run.sample(file, language, locale)
            except Exception as error:  # the next sample may still be read
                run.note(file, [repr(error)])
            print(f"{os.path.basename(file)} {language}: {time.monotonic() - start:.1f} s", flush=True)
    if not only:
        acting.run_cases(run)
    return run.finish()


if __name__ == "__main__":
    sys.exit(main(*sys.argv[1:]))
