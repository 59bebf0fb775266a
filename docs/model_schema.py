"""What the schema of model files says of classes: fields, values, and where a class may stand."""

import dataclasses
import re

# Definitions that are no classes: what the reference calls their values.
PLAIN = {"NAME": "name", "LINE": "text of one line", "TEXT": "deck text", "INT": "whole number",
         "TRIPLE": "three numbers", "COMPLEX": "number, or real and imaginary part", "TABLE": "rows of numbers",
         "LABELS": "labels", "FACETS": "facets", "REGION": "region", "POINTER": "JSON pointer",
         "POINTERS": "JSON pointers", "REFERENCE": "name", "REGIONS": "region, or list of regions",
         "NODES": "nodes", "ELEMENTS": "elements", "MESH": "mesh", "MEMBERS": "members",
         "DATUM": "datum", "SET": "set", "ASSEMBLY_SET": "set of the assembly", "PART": "part", "INSTANCE": "instance",
         "ASSEMBLY": "assembly", "MODEL": "model"}
PLURALS = {"number": "numbers", "whole number": "whole numbers", "name": "names", "text": "texts",
           "text of one line": "texts of one line", "datum": "datums", "set": "sets", "elements": "elements of a type",
           "set of the assembly": "sets of the assembly", "region": "regions"}
# What is said of every class in the same words.
SAID_ONCE = {"class"}
STATE_SAID_ONCE = {"deactivated", "status"}
UNIONS = ("anyOf", "oneOf", "allOf")


def short(name):
    """A class's name without its prefix, in comparisons."""
    return re.sub(r"^[a-z]+[A-Z]?_", "", name).lower()


@dataclasses.dataclass
class Field:
    name: str
    value: str
    default: str
    meaning: str
    required: bool = False


@dataclasses.dataclass
class Class:
    key: str
    name: str
    description: str
    fields: list
    states: list


class Schema:
    def __init__(self, document):
        self.definitions = document["$defs"]
        # A class's definition is an object's, and is called as the class is: a prefix of small letters, an underscore.
        self.keys = [key for key, definition in self.definitions.items()
                     if re.match(r"^[a-z]+[A-Z]?_\w+$", key) and "properties" in definition]
        self.names = {key: self.name_of(key) for key in self.keys}
        # The page that tells of each class, and its title; whoever writes pages fills it.
        self.pages = {}

    def name_of(self, key):
        """The name that people use: the first that the class's own member takes."""
        node = self.definitions[key]["properties"].get("class", {})
        for each in node.get("anyOf", ()):
            if "enum" in each:
                return each["enum"][0]
        twins = [other for other in self.keys if short(other) == short(key)]
        return re.sub(r"^[a-z]+[A-Z]?_", "", key) if len(twins) == 1 else key

    # -- Places

    def containers(self):
        """Members of a model, each with what may stand in it."""
        return self.definitions["MODEL"]["properties"]

    def target(self, node):
        return node["$ref"].split("/")[-1] if isinstance(node, dict) and "$ref" in node else None

    def alternatives(self, node):
        """The nodes that a value may be read by, references followed to classes alone."""
        if not isinstance(node, dict):
            return
        target = self.target(node)
        if target is not None:
            if target in self.names:
                yield target, self.definitions[target]
            else:
                yield from self.alternatives(self.definitions[target])
            return
        found = False
        for word in UNIONS:
            for each in node.get(word, ()):
                for pair in self.alternatives(each):
                    found = True
                    yield pair
        for word in ("then", "else"):
            for pair in self.alternatives(node.get(word)):
                found = True
                yield pair
        if not found and ("properties" in node or "items" in node or "additionalProperties" in node):
            yield None, node

    def classes_below(self, node, seen):
        """Keys of all classes that a value of the node may hold, the nearest first."""
        waiting = [node]
        while waiting:
            level, waiting = waiting, []
            for each in level:
                for key, found in self.alternatives(each):
                    if key is not None:
                        if key in seen:
                            continue
                        seen.add(key)
                        yield key
                    for name, below in found.get("properties", {}).items():
                        # What a step says of an object is told with the object.
                        waiting += self.state_of(below).values() if name == "states" else [below]
                    waiting += [found[word] for word in ("items", "additionalProperties") if word in found]

    def occurrences(self, value, node, pointer=""):
        """Where a value of a model file is of a class: (key, pointer, value)."""
        if isinstance(value, list):
            for _, found in self.alternatives(node):
                if "items" in found:
                    for place, each in enumerate(value):
                        yield from self.occurrences(each, found["items"], f"{pointer}/{place}")
            return
        if not isinstance(value, dict):
            return
        candidates = list(self.alternatives(node))
        wanted = value.get("class")
        if wanted is not None:
            exact = [pair for pair in candidates if pair[0] == wanted]
            candidates = exact or [pair for pair in candidates if pair[0] and short(pair[0]) == short(wanted)][:1]
        if not candidates:
            return
        key, found = candidates[0]
        if key is not None:
            yield key, pointer, value
        for name, each in value.items():
            below = found.get("properties", {}).get(name, found.get("additionalProperties"))
            if isinstance(below, dict):
                step = name.replace("~", "~0").replace("/", "~1")
                yield from self.occurrences(each, below, f"{pointer}/{step}")

    # -- Classes

    def describe(self, key):
        definition = self.definitions[key]
        fields, states = [], []
        for name, node in definition.get("properties", {}).items():
            if name == "states":
                states = [self.field(each, below, ()) for each, below in self.state_of(node).items()
                          if each not in STATE_SAID_ONCE]
            elif name not in SAID_ONCE:
                fields.append(self.field(name, node, definition.get("required", ())))
        return Class(key, self.names.get(key, key), definition.get("description", ""), fields, states)

    def state_of(self, node):
        for _, found in self.alternatives(node.get("additionalProperties", {})):
            if "properties" in found:
                return found["properties"]
        return {}

    def field(self, name, node, required):
        default = node.get("default")
        text = "" if default is None or default == "" else f"`{self.shown(default)}`"
        return Field(name, self.value(node), text, node.get("description", ""), name in required)

    @staticmethod
    def shown(value):
        if isinstance(value, bool):
            return "true" if value else "false"
        if isinstance(value, float):
            return f"{value:g}"
        return str(value)

    def value(self, node):
        """What a value may be, in a few words."""
        target = self.target(node)
        if target is not None:
            if target in self.names:
                return self.link(target)
            return PLAIN[target] if target in PLAIN else self.value(self.definitions[target])
        if "const" in node:
            return f"`{node['const']}`"
        if "enum" in node:
            return ", ".join(f"`{self.shown(each)}`" for each in node["enum"] if each is not None)
        parts = [each for word in UNIONS for each in node.get(word, ())]
        if parts:
            return self.value_of_union(parts)
        if "if" in node or "then" in node:
            return self.value_of_union([node[word] for word in ("then", "else") if isinstance(node.get(word), dict)])
        kind = node.get("type")
        if kind == "array":
            item = self.value(node.get("items", {}))
            return "list of " + PLURALS.get(item, item)
        if kind == "object":
            more = node.get("additionalProperties")
            if isinstance(more, dict) and more:
                return "by name: " + self.value(more)
            return "object"
        if isinstance(kind, list):
            kind = next((each for each in kind if each != "null"), "value")
        return {"boolean": "true or false", "string": "text", "integer": "whole number"}.get(kind, kind or "value")

    def value_of_union(self, parts):
        parts = [part for part in parts if part.get("type") != "null" and "state" not in part.get("properties", {})
                 and not (part.get("type") == "string" and "pattern" in part)]
        parts = [self.definitions[self.target(part)] if self.is_choice(part) else part for part in parts]
        if any("enum" in part or "const" in part for part in parts):
            # Any capitals, and the number of a word, are taken too.
            parts = [part for part in parts if "const" in part or "enum" in part and
                     any(isinstance(each, str) for each in part["enum"])] or parts
        keys = [key for part in parts for key, _ in self.alternatives(part)]
        pages = {self.pages.get(key) for key in keys}
        if len(keys) > 4 and None not in keys and len(pages) == 1 and None not in pages:
            file, title = pages.pop()
            return f"one of the [classes of {title.lower()}]({file}.md)"
        texts = list(dict.fromkeys(self.value(part) for part in parts))
        return ", or ".join(texts) if len(texts) < 4 else ", ".join(texts)

    def is_choice(self, node):
        """Whether it refers to a definition that is words alone."""
        target = self.target(node)
        return target is not None and target not in PLAIN and target not in self.names and (
            "enum" in self.definitions[target])

    def link(self, key):
        file, _ = self.pages.get(key, ("index", ""))
        return f"[{self.names[key]}]({file}.md#{self.names[key].lower()})"
