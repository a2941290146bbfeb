#!/usr/bin/env python3
"""Opens pages of all samples in a browser and compares what it gives to a screen reader with `axvelto tree`.

    check_page.py BUILD_FOLDER AXE_SCRIPT [SAMPLE...]
"""
import json
import os
import pathlib
import subprocess
import sys
import tempfile

from selenium import webdriver
from selenium.webdriver.chrome.service import Service

SWITCHES = ("--headless --no-sandbox --disable-gpu --disable-quic --no-first-run --disable-background-networking "
            "--disable-component-update --disable-sync").split()
LOCALES = ("en_US", "de_DE", "ar_EG")
NARROW, WIDE = 320, 1200

# What stands for the roles of `axvelto tree`. Texts and plain elements have none of their own.
ROLES = {"header": "heading", "button": "button", "link": "link", "image": "image", "adjustable": "slider",
         "chart": "figure", "container": "group"}
TEXT = ("paragraph", "rowheader")
LIVE = set(ROLES.values()) | set(TEXT)


def browser(profile):
    options = webdriver.ChromeOptions()
    for switch in SWITCHES:
        options.add_argument(switch)
    options.add_argument(f"--user-data-dir={profile}")
    options.set_capability("goog:loggingPrefs", {"performance": "ALL", "browser": "ALL"})
    options.binary_location = "/usr/bin/chromium"
    return webdriver.Chrome(options=options, service=Service("/usr/bin/chromedriver"))


def command(program, *arguments):
    return subprocess.run([program, *arguments], check=True, capture_output=True, text=True).stdout


def text_of(text):
    if isinstance(text, dict):
        text = text.get("spoken", text["string"])
    return " ".join((text or "").split())


def heading_in(chart):
    headings = [each for each in chart.get("children", []) if each["role"] == "header"]
    return text_of(headings[0]["label"]) if headings else ""


def expected(nodes, chart_names, untitled):
    """The elements in order, each as what a browser is to say of it."""
    found = []
    for node in nodes:
        name = text_of(node["label"])
        if node["role"] == "chart":
            name = chart_names.pop(0) or name or heading_in(node) or untitled
        found.append({"role": ROLES.get(node["role"], "text"), "name": name, "hint": text_of(node["hint"]),
                      "value": text_of(node["value"])})
        if node["role"] == "header" and "button" in node["traits"]:
            found[-1]["hint"] = ""
            found[-1]["value"] = ""
            found.append({"role": "button", "name": name, "hint": text_of(node["hint"]),
                          "value": text_of(node["value"])})
        found += expected(node.get("children", []), chart_names, untitled)
    return found


class Tree:
    """The accessibility tree of the page, with the attributes of the document's elements."""

    def __init__(self, driver):
        self.nodes = {}
        for node in driver.execute_cdp_cmd("Accessibility.getFullAXTree", {})["nodes"]:
            self.nodes[node["nodeId"]] = node
        self.attributes = {}
        self.collect(driver.execute_cdp_cmd("DOM.getDocument", {"depth": -1})["root"])
        self.root = next(node for node in self.nodes.values() if "parentId" not in node)

    def collect(self, node):
        pairs = node.get("attributes", [])
        self.attributes[node["backendNodeId"]] = dict(zip(pairs[::2], pairs[1::2]))
        for child in node.get("children", []):
            self.collect(child)

    def classes(self, node):
        return self.attributes.get(node.get("backendDOMNodeId"), {}).get("class", "").split()

    def children(self, node):
        return [self.nodes[i] for i in node.get("childIds", []) if i in self.nodes]

    def text(self, node):
        if node["role"]["value"] == "StaticText":
            return node["name"]["value"]
        return " ".join(self.text(child) for child in self.children(node))

    def walk(self, node):
        yield node
        for child in self.children(node):
            yield from self.walk(child)

    def sections(self):
        return [node for node in self.walk(self.root) if node["role"]["value"] == "article"]

    def lists(self, node):
        """The outermost lists of elements."""
        if "elements" in self.classes(node):
            return [node]
        return [found for child in self.children(node) for found in self.lists(child)]

    def said(self, node):
        """What the browser says of each element below, in order."""
        found = []
        for child in self.children(node):
            role = child["role"]["value"]
            is_picture = "viewBox" in self.attributes.get(child.get("backendDOMNodeId"), {})
            if is_picture or "caption" in self.classes(child) or role.lower() == "audio":
                continue
            if "value" in self.classes(child) or (role in ("cell", "gridcell") and "number" not in self.classes(child)):
                if found and not self.in_slices(child):
                    found[-1]["value"] = " ".join(self.text(child).split())
                continue
            if role in LIVE and not child.get("ignored") and not self.in_slices(child):
                found.append(self.one(child, role))
            found += self.said(child)
        return found

    def in_slices(self, node):
        """Whether a cell stands in a table without numbers: of slices, which are no elements."""
        while node is not None and node["role"]["value"] != "row":
            node = self.nodes.get(node.get("parentId"))
        return node is not None and not any("number" in self.classes(child) for child in self.children(node))

    def one(self, node, role):
        name = node.get("name", {}).get("value", "") or (self.text(node) if role in TEXT else "")
        # The protocol tells a slider's number and not its text, which stands at the element alone.
        attributes = self.attributes.get(node.get("backendDOMNodeId"), {})
        value = attributes.get("aria-valuetext", "") if role == "slider" else ""
        return {"role": "text" if role in TEXT else role, "name": " ".join(name.split()),
                "hint": node.get("description", {}).get("value", ""), "value": value}


class Check:
    def __init__(self, build, axe, samples):
        self.program = str(pathlib.Path(build, "bin", "axvelto"))
        self.axe = pathlib.Path(axe).read_text()
        self.samples = samples
        self.faults = []

    def fault(self, where, what):
        print(f"{where}: {what}")
        self.faults.append(where)

    def run(self):
        with tempfile.TemporaryDirectory() as folder:
            self.driver = browser(os.path.join(folder, "profile"))
            try:
                for locale in LOCALES:
                    page = os.path.join(folder, f"{locale}.html")
                    command(self.program, "page", *self.samples, "-o", page, "--locale", locale)
                    self.check_page(locale, page)
            finally:
                self.driver.quit()
        print(f"{len(self.samples)} samples in {len(LOCALES)} languages: "
              + ("no fault" if not self.faults else f"{len(self.faults)} faults"))
        return 1 if self.faults else 0

    def check_page(self, locale, page):
        self.width(WIDE)
        self.driver.get(f"file://{page}")
        self.check_elements(locale)
        self.check_sounds(locale)
        self.check_width(locale, NARROW)
        self.check_width(f"{locale}, text of 200 percent", 2 * NARROW, "200%")
        for scheme in ("light", "dark"):
            features = [{"name": "prefers-color-scheme", "value": scheme}]
            self.driver.execute_cdp_cmd("Emulation.setEmulatedMedia", {"features": features})
            self.check_rules(f"{locale}, {scheme}")
        self.check_requests(locale, page)

    def check_elements(self, locale):
        tree = Tree(self.driver)
        sections = tree.sections()
        if len(sections) != len(self.samples):
            return self.fault(locale, f"{len(sections)} screens, expected {len(self.samples)}")
        for sample, section in zip(self.samples, sections):
            self.compare(f"{sample}, {locale}", self.wanted(sample, locale),
                         [said for each in tree.lists(section) for said in tree.said(each)])

    def check_sounds(self, locale):
        """Every figure of a chart holds a sound that the browser can play, longer than two tones."""
        lengths = self.driver.execute_async_script("""
            const done = arguments[0];
            const length = audio => new Promise(end => {
              audio.addEventListener('loadedmetadata', () => end(audio.duration));
              audio.addEventListener('error', () => end(0));
              audio.load();
            });
            const figures = [...document.querySelectorAll('figure')];
            Promise.all(figures.map(f => f.querySelector('audio')).map(a => a ? length(a) : 0)).then(done);""")
        if not lengths or min(lengths) < 1:
            self.fault(locale, f"charts without sound: {lengths}")

    def wanted(self, sample, locale):
        elements = json.loads(command(self.program, "tree", sample, "--locale", locale))["elements"]
        charts = json.loads(command(self.program, "graph", sample, "--locale", locale, "--json"))["charts"]
        untitled = {"en_US": "Chart without a title", "de_DE": "Diagramm ohne Titel",
                    "ar_EG": "مخطط بياني بلا عنوان"}[locale]
        return expected(elements, [text_of(chart["name"]) for chart in charts], untitled)

    def compare(self, where, wanted, said):
        for i in range(max(len(wanted), len(said))):
            one, other = (of[i] if i < len(of) else None for of in (wanted, said))
            if one != other:
                return self.fault(where, f"element {i + 1}: the browser says {other}, expected {one}")

    def width(self, width):
        self.driver.execute_cdp_cmd("Emulation.setDeviceMetricsOverride", {
            "width": width, "height": 900, "deviceScaleFactor": 1, "mobile": False})

    def check_width(self, where, width, text="100%"):
        self.width(width)
        wider = self.driver.execute_script("""
            document.documentElement.style.fontSize = arguments[0];
            const width = document.documentElement.clientWidth;
            const wide = [...document.querySelectorAll('body *')].filter(e => {
              const box = e.getBoundingClientRect();
              return !e.closest('svg *') && box.width > 0 && (box.right > width + 0.5 || box.left < -0.5);
            });
            const texts = wide.slice(0, 3).map(e => e.outerHTML.slice(0, 120));
            if (document.documentElement.scrollWidth > width) texts.push('the page scrolls sideways');
            document.documentElement.style.fontSize = '';
            return texts;""", text)
        self.width(WIDE)
        for what in wider:
            self.fault(f"{where}, {width} pixels", f"overflows: {what}")

    def check_rules(self, where):
        found = self.driver.execute_cdp_cmd("Runtime.evaluate", {
            "expression": self.axe + "; axe.run(document).then(r => JSON.stringify({rules: r.passes.length, violations:"
                          " r.violations.map(v => v.id + ': ' + v.help + ' ' + v.nodes.length + ' '"
                          " + v.nodes[0].html.slice(0, 160))}))",
            "awaitPromise": True, "returnByValue": True})["result"].get("value")
        result = json.loads(found) if found else {"rules": 0, "violations": []}
        if result["rules"] == 0:
            self.fault(where, "the rules did not run")
        for violation in result["violations"]:
            self.fault(where, violation)

    def check_requests(self, locale, page):
        for entry in self.driver.get_log("performance"):
            message = json.loads(entry["message"])["message"]
            if message["method"] != "Network.requestWillBeSent":
                continue
            url = message["params"]["request"]["url"]
            if url != f"file://{page}" and not url.startswith(("data:", "chrome:", "about:")):
                self.fault(locale, f"asks for {url}")
        for entry in self.driver.get_log("browser"):
            self.fault(locale, f"the browser complains: {entry['message']}")
        if self.driver.execute_script("return getComputedStyle(document.body).maxWidth") == "none":
            self.fault(locale, "the style sheet is not in force")


if __name__ == "__main__":
    if len(sys.argv) < 3:
        sys.exit(__doc__)
    samples = sys.argv[3:] or sorted(map(str, [*pathlib.Path("samples").glob("*.json"),
                                               *pathlib.Path("samples/workouts").iterdir()]))
    sys.exit(Check(sys.argv[1], sys.argv[2], samples).run())
