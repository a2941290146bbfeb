"""What follows from a key is heard. Each case opens a sample, presses keys and waits for the words."""

import json
import os

import expected
import sound
from desktop import PATIENCE, xdotool

# The sample; where the focus is first, as its line begins; then keys, each with what is to be heard of it, in order.
CASES = [
    (
        "day-detail.json",
        "Move, Page 1 of 3",
        [
            ("Up", ["Move, Page 2 of 3", "Layout changed"]),
            ("Down", ["Move, Page 1 of 3", "Layout changed"]),
            ("Down", ["Layout changed"]),
            ("shift+Tab", ["349 of 500 calories"]),
            ("Return", ["Nothing happened"]),
            ("8", ["No chart here"]),
            ("End", ["Total calories"]),
            ("Tab", ["Nothing more in this direction"]),
        ],
    ),
    (
        "workout-detail.json",
        "Splits",
        [("Return", ["collapsed"]), ("Return", ["expanded"]), ("b", ["No heart rate data"]), ("h", ["Nothing more"])],
    ),
    (
        "day.json",
        "Move, 349 of 500 calories",
        [
            ("Right", ["0 calories"]),
            ("Right", ["0 calories", "No audio device"]),
            ("Right", ["72 calories"]),
            ("Left", ["0 calories"]),
            ("8", ["No such slice"]),
            ("shift+c", ["Nothing more"]),
            ("c", ["0 minutes"]),
        ],
    ),
    (
        "workout-heart-rate.json",
        "Heart rate, chart",
        [("Right", ["97 beats per minute, 1 of 53", "No audio device"]), ("space", []), ("Right", ["101 beats"])],
    ),
]


def hears(run, since, wanted):
    def is_said(texts):
        heard, at = expected.bare(" ".join(texts)), 0
        for words in map(expected.bare, wanted):
            at = heard.find(words, at)
            if at < 0:
                return False
            at += len(words)
        return True

    return run.reader.speech.wait_for(is_said, since, PATIENCE)


def goes_to(run, file, words):
    """From the first element, until the words are heard. Where they begin no line, it fails."""
    lines = run.output("speak", file, "--locale", "en_US").splitlines()[1:]
    place = next(number for number, line in enumerate(lines) if line.startswith(words))
    xdotool("key", "End")
    since = run.reader.rest()
    xdotool("key", "Home")
    if place:
        # A focus that comes back before the reader has heard that it left is not told.
        run.reader.speech.wait_for(bool, since, PATIENCE)
        since = run.reader.rest()
        xdotool("key", *["Tab"] * place)
    return hears(run, since, [words])


def case(run, sample, place, steps):
    run.reader.rest(1)
    file = os.path.join(run.samples, sample)
    window = run.open(file, "--locale", "en_US")
    try:
        window.accessible()
        if not goes_to(run, file, place):
            yield f"\"{place}\" was not heard"
            return
        for key, wanted in steps:
            since = run.reader.rest()
            xdotool("key", key)
            if not hears(run, since, wanted):
                yield f"after {key} {wanted} was to be heard: {[text for _, text in run.reader.speech.said(since)]}"
        if window.close() != 0:
            yield f"the program did not end well: {window.log()[-2000:]}"
        if window.log().count("No audio device") > 1:
            yield f"silence is told more than once: {window.log()}"
    finally:
        window.end()


def notes(run):
    """A step in a chart is a note of the pitch that its value has on the vertical axis."""
    file = os.path.join(run.samples, "workout-heart-rate.json")
    chart = json.loads(run.output("graph", file, "--json"))["charts"][0]
    vertical = chart["axes"][1]
    with sound.Device(run.folder) as device:
        window = run.open(file, "--locale", "en_US")
        try:
            if not goes_to(run, file, "Heart rate, chart"):
                yield "the chart was not heard"
                return
            for value in vertical["values"][:6]:
                xdotool("key", "Right")
                wanted = sound.pitch_of(value, vertical["minimum"], vertical["maximum"])
                heard = device.next_pitch(PATIENCE)
                if heard is None or abs(heard / wanted - 1) > 0.02:
                    yield f"{value} sounds at {heard} hertz, expected {wanted:.0f}"
            if window.close() != 0 or "No audio device" in window.log():
                yield f"the program did not end well: {window.log()[-2000:]}"
        finally:
            window.end()


def unreadable(run):
    """A file that is no screen is told in the window, aloud and on standard error."""
    file = os.path.join(run.folder, "broken.json")
    with open(file, "w") as out:
        out.write('{"format": "axvelto-scene/1", "screen": {"class": "Nothing"}}')
    since = run.reader.rest(1)
    window = run.open(file)
    try:
        if not hears(run, since, ["Nothing"]):
            yield f"the fault was not heard: {[text for _, text in run.reader.speech.said(since)]}"
        if "broken.json" not in window.log() or "Nothing" not in window.log():
            yield f"standard error tells no fault: {window.log()}"
        yield from run.picture(window, "unreadable")
        status = window.close()
        if status != 2:
            yield f"exit status {status} after a file that cannot be read"
    finally:
        window.end()


def run_cases(run):
    for sample, place, steps in CASES:
        run.note(sample, case(run, sample, place, steps))
    run.note("broken.json", unreadable(run))
    run.note("notes", notes(run))
