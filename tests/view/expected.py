"""What assistive technology is to meet, derived from what `axvelto tree` prints."""

import re

# What a role is called on the bus, the trait that it tells, and what the screen reader calls it.
ROLES = {
    "container": ("panel", None),
    "chart": ("chart", None),
    "element": ("label", None),
    "staticText": ("label", None),
    "image": ("image", "image"),
    "link": ("link", "link"),
    "button": ("push button", "button"),
    "adjustable": ("slider", "adjustable"),
    "header": ("heading", "header"),
}
STATES = {"selected": "selected", "disabled": None, "expanded": "expanded", "collapsed": None, "modal": "modal"}
ACTIONS = {"activate": "Press", "increment": "Increase", "decrement": "Decrease"}
SEPARATORS = {"en": ", ", "ar": "، "}
# The words of traits that a role does not tell.
WORDS = {
    "en": {"button": "button", "link": "link", "image": "image", "adjustable": "adjustable", "selected": "selected"},
    "ar": {"button": "زر", "link": "رابط", "image": "صورة", "adjustable": "قابل للضبط", "selected": "محدد"},
}
MODAL = {"en": "covers the rest of the screen", "ar": "يغطي بقية الشاشة"}
# What the screen reader says for a word of the transcript.
SPOKEN = {"adjustable": "slider", "not available": "grayed"}


# Stands for what is spoken of a length of time, which a screen shows in figures.
SPOKEN_TIME = "\N{CLOCK FACE ONE OCLOCK}"


def text(value, separator):
    if isinstance(value, dict):
        bytes_shown = value["string"].encode()
        for attribute in reversed(value["attributes"]):
            start, length = attribute["range"]
            bytes_shown = bytes_shown[:start] + SPOKEN_TIME.encode() + bytes_shown[start + length :]
        value = bytes_shown.decode()
    one_line = re.sub(r"[ \t]*[\r\n][ \t\r\n]*", separator, (value or "").strip(" \t\r\n"))
    return re.sub(r"[ \t]+", " ", one_line)


def is_same(expected, found):
    """Whether a text is as expected; how lengths of time are spoken, the transcript tells."""
    pattern = ".+".join(re.escape(part) for part in expected.split(SPOKEN_TIME))
    return re.fullmatch(pattern, found) is not None


def join(pieces, separator):
    said = ""
    for piece in pieces:
        if piece and separator + piece + separator not in separator + said + separator:
            said = said + separator + piece if said else piece
    return said


def flat(nodes, depth=0):
    """The nodes with their depths, parents before their children."""
    for node in nodes:
        yield depth, node
        yield from flat(node.get("children", []), depth + 1)


def names(node, language, opens_modal, chart_names):
    separator = SEPARATORS[language]
    label, value, hint = (text(node[key], separator) for key in ("label", "value", "hint"))
    label = label or text(chart_names.get(node["id"]), separator)
    if node["role"] == "container":
        return "", label
    told = ROLES[node["role"]][1]
    untold = [word for trait, word in WORDS[language].items() if trait in node["traits"] and trait != told]
    name = join([label, value, *untold, MODAL[language] if opens_modal else ""], separator)
    return name, hint if join([name, hint], separator) != name else ""


def tree(document, charts, language):
    """The elements as the bus has them, each a dictionary, in order."""
    modal_ahead = False
    chart_names = {chart["id"]: chart["name"] for chart in charts["charts"] if chart["id"]}
    for depth, node in flat(document["elements"]):
        states = node.get("states", [])
        modal_ahead = modal_ahead or "modal" in states
        opens_modal = modal_ahead and node["isElement"]
        modal_ahead = modal_ahead and not opens_modal
        name, description = names(node, language, opens_modal, chart_names)
        role = "dialog" if "modal" in states else ROLES[node["role"]][0]
        yield {
            "depth": depth,
            "role": role,
            "name": name,
            "description": description,
            "states": sorted(filter(None, (STATES[state] for state in states))),
            "isEnabled": "disabled" not in states,
            "actions": sorted(ACTIONS[action] for action in node.get("actions", [])),
            "frame": node["frame"],
        }


def bare(line):
    """A spoken line without punctuation and case, so that pauses do not matter."""
    return " ".join(re.findall(r"[^\W_]+", line.lower()))


def spoken(line):
    """The pieces of a transcript's line as the screen reader says them."""
    return [bare(SPOKEN.get(piece, piece)) for piece in line.split(", ")]
