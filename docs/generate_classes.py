#!/usr/bin/env python3
"""Writes the reference of classes: fields from the schema, examples and deck lines from runs of the program.

usage: generate_classes.py QRXDECK ROOT FOLDER
"""

import argparse
import json
import pathlib
import subprocess
import sys

from deck_lines import Decks
from model_schema import Schema

# Pages, each with the members of a model whose classes it has, in the order in which classes are looked for.
PAGES = [
    ("boundary_conditions", "Boundary conditions", ["boundaryConditions"],
     "Supports and prescribed values. They live across steps: [How steps work](../steps.md)."),
    ("loads", "Loads", ["loads"], "Loads live across steps: [How steps work](../steps.md)."),
    ("fields", "Fields", ["fields"], "Predefined fields: temperatures, initial velocities, initial stresses and others."),
    ("contact", "Contact and interactions",
     ["interactions", "interactionProperties", "contactControls", "contactInitializations"],
     "Contact, films, radiation, waves, sensors; and the properties and controls that they name."),
    ("constraints", "Constraints", ["constraints"], "What ties nodes and surfaces to one another, in all steps."),
    ("output", "Output", ["fieldOutputRequests", "historyOutputRequests", "timePoints"],
     "Requests live across steps. [Output that you wanted](../recipes/output.md) tells which, of what, how often."),
    ("steps", "Steps", ["steps"],
     "The procedures, and what belongs to a step: controls, restart data, prints, damping, load cases."),
    ("materials", "Materials", ["materials"],
     "A material has no `class`: its options are members, each there or not. Tables have a row for each point, with "
     "columns as the option says."),
    ("sections", "Sections", ["sections", "beamProfiles"],
     "Sections give elements their material, thickness or profile; the sections of connectors have their behaviour."),
    ("amplitudes", "Amplitudes", ["amplitudes"], "Courses of time, or of frequency, that loads and conditions name."),
    ("adaptivity", "Adaptive meshing", ["adaptiveMeshControls", "adaptiveMeshConstraints"], ""),
    ("frame", "Parts, instances, datums", ["cyclicSymmetry", "parts", "assembly", "datums"],
     "What of a model has no class is told in [The model file](../model-file.md); these records stand in it."),
]
# Pieces of the frame that are no classes, but have fields.
FRAME = ["MODEL", "PART", "INSTANCE", "ASSEMBLY", "MESH", "NODES", "ELEMENTS", "SET", "ASSEMBLY_SET", "DATUM"]
FRAME_NAMES = {"MODEL": "A model", "PART": "A part", "INSTANCE": "An instance", "ASSEMBLY": "The assembly",
               "MESH": "A mesh", "NODES": "Nodes", "ELEMENTS": "Elements of a type", "SET": "A set of a mesh",
               "ASSEMBLY_SET": "A set of the assembly", "DATUM": "A datum"}
MODELS = ["tests/decks/*.json", "examples/*/*.json", "docs/recipes/*.json", "docs/classes.json"]
# Classes whose lines are told of elsewhere, or that are for nobody but the program.
ELSEWHERE = {"odiK_Tie": "Its lines are those of a Tie.",
             "kinC_SurfacePair": "Its lines are those of the general contact that it stands in.",
             "odiK_IgnoredFinding": "It is for the reports of the program; no deck tells of it."}
# Most lines of an example, and of the lines of a deck that are shown.
MOST_LINES, MOST_TEXT = 24, 900
# How many objects of a class are tried for one that shows well.
TRIES = 4


def cell(text):
    return " ".join(text.split()).replace("|", "\\|")


def sentence(text):
    text = " ".join(text.split())
    if not text:
        return ""
    return text[0].upper() + text[1:] + ("" if text[-1] in ".!?" else ".")


def escaped(text):
    """Descriptions are plain text: what would be mark-up is not."""
    for character in "*_<[":
        text = text.replace(character, "\\" + character)
    return text


def compact(value, indent=0, width=80):
    """JSON in few lines."""
    text = json.dumps(value, ensure_ascii=False)
    if len(text) + indent <= width or not isinstance(value, (dict, list)) or not value:
        return text
    if isinstance(value, dict):
        rows = [f"{json.dumps(name, ensure_ascii=False)}: {compact(each, indent + 2, width)}"
                for name, each in value.items()]
        begin, end = "{", "}"
    else:
        rows, begin, end = [compact(each, indent + 2, width) for each in value], "[", "]"
    inner = " " * (indent + 2)
    return begin + "\n" + ",\n".join(inner + row for row in rows) + "\n" + " " * indent + end


def table(fields, title):
    """Rows of fields, with their defaults where any has one."""
    if not fields:
        return []
    defaults = any(field.default for field in fields)
    heads = [title, "value", *(["default"] if defaults else []), " "]
    lines = ["```{rst-class} " + ("fields defaults" if defaults else "fields"), "```", "",
             f"| {' | '.join(heads)} |", "|---" * len(heads) + "|"]
    for field in fields:
        name = f"`{field.name}`" + (" (needed)" if field.required else "")
        cells = [name, cell(field.value), *([cell(field.default)] if defaults else []), cell(escaped(field.meaning))]
        lines.append(f"| {' | '.join(cells)} |")
    return lines + [""]


class Reference:
    def __init__(self, program, root, folder):
        self.root, self.folder = root, folder
        document = json.loads(subprocess.run([program, "schema"], capture_output=True, text=True, check=True).stdout)
        self.schema = Schema(document)
        self.decks = Decks(program)
        self.found = {}
        self.shown = 0
        # Classes of which there is neither a line nor a word why.
        self.bare = []

    def read_models(self):
        """Objects of all models, by class."""
        self.models = {}
        for pattern in MODELS:
            for path in sorted(self.root.glob(pattern)):
                document = self.decks.canonical(path)
                if document is None or len(json.dumps(document)) > 200_000:
                    continue
                name = str(path.relative_to(self.root))
                self.models[name] = document
                for model, value in document["models"].items():
                    place = "/models/" + model.replace("~", "~0").replace("/", "~1")
                    node = self.schema.definitions["MODEL"]
                    for key, pointer, each in self.schema.occurrences(value, node, place):
                        self.found.setdefault(key, []).append((name, pointer, each))

    def example(self, key):
        """Pointer, JSON, deck lines of an object of the class that shows well, and why there are none; or None."""
        def distance(entry):
            return abs(len(json.dumps(entry[2])) - 220)
        best = None
        for name, pointer, value in sorted(self.found.get(key, []), key=distance)[:TRIES]:
            lines = self.decks.lines_of(name, self.models[name], pointer)
            why = "" if lines else self.decks.why_not(self.models[name], pointer)
            if lines and len(lines) <= MOST_LINES:
                return pointer, value, lines, ""
            if best is None or (why and not best[3]):
                best = (pointer, value, lines or [], why)
        return best

    def class_text(self, key, common, common_states, level="##"):
        record = self.schema.describe(key)
        lines = [f"{level} {record.name}", "", escaped(sentence(record.description)), ""]
        if record.key != record.name:
            lines += [f"In full `{record.key}`.", ""]
        lines += table([field for field in record.fields if field not in common], "field")
        lines += table([field for field in record.states if field not in common_states], "in a step")
        example = self.example(key)
        if example is None:
            return lines + self.reason(key)
        pointer, value, deck, why = example
        text = compact(value)
        if len(text) <= MOST_TEXT:
            name = pointer.split("/")[-1].replace("~1", "/").replace("~0", "~")
            prefix = "" if name.isdigit() else json.dumps(name, ensure_ascii=False) + ": "
            lines += ["```json", prefix + text, "```", ""]
            if deck:
                self.shown += 1
                if len(deck) > MOST_LINES:
                    deck = deck[:MOST_LINES] + ["..."]
                lines += ["```inp", *deck, "```", ""]
        return lines if deck else lines + self.reason(key, why)

    def reason(self, key, why=""):
        """Why a class has no lines."""
        if key in ELSEWHERE:
            return [ELSEWHERE[key], ""]
        if not why:
            self.bare.append(key)
            return []
        return ["No deck has lines of it: " + escaped(why) + ".", ""]

    def deal(self):
        """Which page tells of which classes: by page all of them, and those that stand in a model themselves."""
        containers, seen, dealt = self.schema.containers(), set(), {}
        named = {member for _, _, members, _ in PAGES for member in members}
        for file, title, members, _ in PAGES:
            keys, direct = [], []
            if file == "frame":
                members = members + [member for member in containers if member not in named]
            for member in members:
                node = containers.get(member)
                if node is None:
                    continue
                below = list(self.schema.classes_below(node, seen))
                keys += below
                direct += [key for key in below if key in self.direct_of(node)]
            dealt[file] = (keys, direct)
            self.schema.pages.update({key: (file, title) for key in keys})
        return dealt

    def page(self, file, title, text, keys, direct):
        lines = [f"# {title}", "", text, ""]
        common, states = self.common(direct)
        if common or states:
            lines += ["All of these have:", ""] + table(common, "field") + table(states, "in a step")
        for group in (direct, [key for key in keys if key not in direct]):
            ordered = sorted(group, key=lambda key: self.schema.names[key].lower())
            if not ordered:
                continue
            if group is not direct:
                lines += ["## What stands in them", ""]
            for key in ordered:
                lines += self.class_text(key, common if group is direct else [], states if group is direct else [],
                                         "##" if group is direct else "###")
        if file == "frame":
            for key in FRAME:
                record = self.schema.describe(key)
                lines += [f"## {FRAME_NAMES[key]}", "", escaped(sentence(record.description)), ""]
                lines += table(record.fields, "member")
        (self.folder / f"{file}.md").write_text("\n".join(lines) + "\n", encoding="utf-8")
        return sorted(self.schema.names[key] for key in direct), len(keys)

    def direct_of(self, node):
        """Classes that stand in a member of a model themselves."""
        found = set()
        for key, each in self.schema.alternatives(node):
            if key is not None:
                found.add(key)
                continue
            for word in ("items", "additionalProperties"):
                found |= {key for key, _ in self.schema.alternatives(each.get(word)) if key is not None}
        return found

    def common(self, keys):
        """Fields that all classes of a page have alike."""
        if len(keys) < 4:
            return [], []
        records = [self.schema.describe(key) for key in keys]
        fields = [field for field in records[0].fields if all(field in record.fields for record in records)]
        states = [field for field in records[0].states if all(field in record.states for record in records)]
        return fields, states

    def write(self):
        self.folder.mkdir(parents=True, exist_ok=True)
        self.read_models()
        rows, total = [], 0
        dealt = self.deal()
        for file, title, _, text in PAGES:
            names, count = self.page(file, title, text, *dealt[file])
            total += count
            rows.append((file, title, names))
        self.variables()
        self.index(rows)
        self.decks.close()
        return total

    def variables(self):
        """What output requests can ask for."""
        told = json.loads(subprocess.run([self.decks.program, "variables", "--json"], capture_output=True, text=True,
                                         check=True).stdout)["variables"]
        lines = ["# Output variables", "",
                 "What requests can ask for, as `qrxdeck variables` lists it; with `--step-type` those of one procedure.",
                 "[Output that you wanted](../recipes/output.md) tells how to ask.", ""]
        for keyword in dict.fromkeys(each["keyword"] for each in told):
            lines += [f"## {keyword.lstrip('*')}", "", "```{rst-class} fields", "```", "",
                      "| name | components | output | meaning |", "|---|---|---|---|"]
            for each in told:
                if each["keyword"] != keyword:
                    continue
                channels = " and ".join(word for word in ("field", "history") if each[word])
                parts = " ".join(f"`{part}`" for part in each["components"])
                lines.append(f"| `{each['name']}` | {parts} | {channels} | {cell(escaped(each['meaning']))} |")
            lines.append("")
        (self.folder / "variables.md").write_text("\n".join(lines) + "\n", encoding="utf-8")

    def index(self, rows):
        lines = ["# Classes", "",
                 "Every class of a model file, with its fields, and with an object of a tested model and the lines that it",
                 "becomes. The program tells the same: `qrxdeck schema` prints it for editors.", "",
                 "- Names of classes are taken with their prefix and without it, in any capitals.",
                 "- Numbers have the units that the model is in; the word in brackets, such as (stress), says which kind.",
                 "- A field that is left out has its default; one without a default is unset.",
                 "- Words are taken in any capitals.", ""]
        lines += ["| | |", "|---|---|"]
        for file, title, names in rows:
            links = ", ".join(f"[{name}]({file}.md#{name.lower()})" for name in names)
            lines.append(f"| [{title}]({file}.md) | {links} |")
        lines.append("| [Output variables](variables.md) | what requests can ask for |")
        lines += ["", "```{toctree}", ":hidden:", "", *[file for file, _, _ in rows], "variables", "```"]
        (self.folder / "index.md").write_text("\n".join(lines) + "\n", encoding="utf-8")


def main():
    parser = argparse.ArgumentParser(description=__doc__)
    parser.add_argument("qrxdeck", type=lambda name: str(pathlib.Path(name).resolve()))
    parser.add_argument("root", type=lambda name: pathlib.Path(name).resolve())
    parser.add_argument("folder", type=pathlib.Path)
    arguments = parser.parse_args()
    reference = Reference(arguments.qrxdeck, arguments.root, arguments.folder)
    classes = reference.write()
    print(f"{classes} classes, {reference.shown} with lines of a deck")
    if reference.bare:
        print("neither lines nor a word why there are none: " + ", ".join(reference.bare), file=sys.stderr)
    return 1 if reference.bare else 0


if __name__ == "__main__":
    sys.exit(main())
