"""What holds for a window with a sample in it. Each check yields its faults."""

import random
import time

import pyatspi

import expected
from desktop import PATIENCE, xdotool

KEYS = """Tab Tab Tab shift+Tab Right Right Left Up Down Return Return Escape Home End h shift+h b shift+b
c shift+c 1 2 5 8 ctrl+plus ctrl+minus ctrl+0 F1 Escape alt F10 space""".split()
STATES = {"selected": pyatspi.STATE_SELECTED, "expanded": pyatspi.STATE_EXPANDED, "modal": pyatspi.STATE_MODAL}


def action_names(accessible):
    if "Action" not in pyatspi.listInterfaces(accessible):
        return set()
    actions = accessible.queryAction()
    return {actions.getName(i) for i in range(actions.nActions)}


def frame_of(accessible, origin):
    """Nothing for what has no area."""
    if "Component" not in pyatspi.listInterfaces(accessible):
        return None
    box = accessible.queryComponent().getExtents(pyatspi.DESKTOP_COORDS)
    return [box.x - origin[0], box.y - origin[1], box.width, box.height]


def found(accessible, origin, depth):
    """What assistive technology reads of what lies below an object."""
    for child in accessible:
        states = child.getState()
        yield {
            "depth": depth,
            "role": child.getRoleName(),
            "name": child.name,
            "description": child.description,
            "states": sorted(name for name, state in STATES.items() if states.contains(state)),
            "isEnabled": states.contains(pyatspi.STATE_ENABLED),
            "actions": sorted(action_names(child) - {"SetFocus"}),
            "frame": frame_of(child, origin),
        }
        yield from found(child, origin, depth + 1)


def tree(window, document, charts, language):
    canvas = window.accessible()
    box = canvas.queryComponent().getExtents(pyatspi.DESKTOP_COORDS)
    wanted = list(expected.tree(document, charts, language))
    have = list(found(canvas, (box.x, box.y), 0))
    if len(wanted) != len(have):
        yield f"{len(have)} elements on the bus, expected {len(wanted)}"
    # The picture begins where it likes, but for all elements alike.
    shifts = set()
    for place, (one, other) in enumerate(zip(wanted, have)):
        frame, at = one.pop("frame"), other.pop("frame")
        for key, wanted_one in one.items():
            is_text = key in ("name", "description")
            if not (expected.is_same(wanted_one, other[key]) if is_text else wanted_one == other[key]):
                yield f"element {place}: {key} {other[key]!r}, expected {wanted_one!r}"
        if at is None or frame[2] <= 0 or frame[3] <= 0:
            if at is not None or (frame[2] > 0 and frame[3] > 0):
                yield f"element {place}: frame {at}, expected {frame}"
            continue
        shifts.add((round(at[0] - frame[0]), round(at[1] - frame[1])))
        if abs(at[2] - frame[2]) > 1 or abs(at[3] - frame[3]) > 1:
            yield f"element {place}: {at[2]} by {at[3]}, expected {frame[2]} by {frame[3]}"
    for axis in (0, 1):
        along = [shift[axis] for shift in shifts]
        if along and max(along) - min(along) > 1:
            yield f"elements are not where they are on the screen: moved by {sorted(set(along))}"


def reading(opened, reader, lines):
    """Reads from the first element to the last and compares with the transcript's lines. The last that it yields
    is the times from each key to what it brought. `opened` counts what was said before the window came."""
    speech, delays = reader.speech, []
    reader.rest()
    since = opened
    xdotool("key", "End")
    reader.rest()
    wanted = [expected.spoken(line) for line in lines[1:]]
    for place, pieces in enumerate(wanted):
        if len(wanted) > 1:  # else it is said as the window opens, and no key moves anything
            since, pressed = speech.count(), time.monotonic()
            xdotool("key", "Tab" if place else "Home")

        def is_said(texts):
            return all(piece in expected.bare(" ".join(texts)) for piece in pieces)

        if not speech.wait_for(is_said, since, PATIENCE):
            yield f"after \"{lines[place + 1]}\" was to be heard: {[text for _, text in speech.said(since)]}", None
        elif len(wanted) > 1:
            delays.append(speech.said(since)[0][0] - pressed)
    yield None, delays


def picture(window, path):
    pixels = window.picture()
    pixels.savev(path, "png", [], [])
    data, width = pixels.get_pixels(), pixels.get_n_channels()
    colours = {data[i : i + 3] for i in range(0, len(data) - width, width * 7)}
    if len(colours) < 8:
        yield f"the window shows {len(colours)} colours"


def random_keys(window, seed):
    keys = random.Random(seed)
    pressed = [keys.choice(KEYS) for _ in range(200)]
    for start in range(0, len(pressed), 20):
        xdotool("key", "--delay", "8", *pressed[start : start + 20])
        if not window.is_running():
            yield f"the program ended after the keys {pressed[: start + 20]}: {window.log()[-2000:]}"
            return
    status = window.close()
    if status != 0:
        yield f"exit status {status} after the keys {pressed}: {window.log()[-2000:]}"
    if "Sanitizer" in window.log() or "runtime error" in window.log():
        yield window.log()[-4000:]
