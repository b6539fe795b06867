"""What the definition files say: ports, parameters, and which key of which factory carries which parameter."""
import glob
import os
import re

from words import decode, split, unpack


class Definition:
    def __init__(self):
        self.name, self.version, self.inputs, self.outputs = "", 0, [], []
        self.aliases, self.parameters = {}, []
        self.kind, self.statements, self.grouped = "", [], ""

    def keys_of(self, parameter):
        return [key for key, value in self.statements if value == f"$({parameter})"]


class Parameter:
    def __init__(self, name):
        self.name, self.flags, self.type, self.config = name, [], "", ""
        self.lookup = []

    def stored_side(self, text):
        sides = (unpack(each) for each in self.lookup)
        return next((decode(stored) for shown, stored in sides if shown == text), text)

    def read_type(self, text):
        words = text.split(" ")
        while words and words[0] in ("OPTIONAL", "OMITTABLE", "INSTANCE_MACROS"):
            self.flags.append(words.pop(0))
        self.type, self.config = (words + [""])[0], " ".join(words[1:])
        return self


def read(folders):
    """All definitions, and the keys of each kind of factory."""
    found, kinds = [], {}
    for folder in folders:
        for path in sorted(glob.glob(os.path.join(folder, "**", "*.ort"), recursive=True)):
            with open(path, encoding="utf-8") as file:
                text = file.read()
            if "# TRANSFORMER_BEGIN " not in text:
                found += _definitions(text, kinds)
    return found, kinds


def _definitions(text, kinds):
    result, current, block = [], Definition(), ""
    lookup = {"INPUT_TAGS:": "inputs", "OUTPUT_TAGS:": "outputs"}
    for line in text.splitlines():
        line = line.strip()
        keyword, _, value = line.partition(" ")
        if block == "TEMPLATE" and line != "TEMPLATE_END":
            _template(current, line, kinds)
        elif line == "TEMPLATE_END":
            result.append(current)
            current, block = Definition(), ""
        elif block:
            block = "" if line == block + "_END" else block
        elif keyword.endswith("_START"):
            block = keyword[:-len("_START")]
        elif keyword in lookup:
            for tag in value.split():
                name, alias = (tag.split(":") + [""])[:2]
                if name != "<NO_INPUT>":
                    getattr(current, lookup[keyword]).append(name)
                    current.aliases[name] = alias or name
        elif keyword == "TRANSFORMER_NAME:":
            current.name = value
        elif keyword == "MULTIPROCESS:":
            current.grouped = value
        elif keyword == "VERSION:":
            current.version = int(value)
        elif keyword == "PARAMETER_NAME:":
            current.parameters.append(Parameter(value))
        elif keyword == "PARAMETER_TYPE:":
            current.parameters[-1].read_type(value)
        elif keyword == "PARAMETER_LOOKUP:":
            current.parameters[-1].lookup += unpack(value, "%")
    return result


def _template(definition, line, kinds):
    words = [word.raw for word in split(line)]
    if words[:1] == ["FACTORY_OPTION"]:
        kinds.setdefault(definition.kind, set()).add(words[2])
        definition.statements.append((words[2], " ".join(words[3:])))
    elif words[:1] == ["FACTORY_DEF"] and words[2] != "TeeFactory":
        definition.kind = words[2]
        keys = kinds.setdefault(words[2], set())
        at = 5
        while at < len(words) and words[at] != "OUTPUT":
            if words[at].startswith("$("):
                at += 1
                continue
            keys.add(words[at])
            definition.statements.append((words[at], words[at + 1]))
            at += 2


TYPED = """TRANSFORMER_NAME: Typed%(name)s
VERSION: 1
CATEGORY: Tests
INPUT_TAGS: INPUT
OUTPUT_TAGS: OUTPUT
PRESERVES_ATTRIBUTES: <ALL>
PARAMETER_NAME: V
PARAMETER_TYPE: %(type)s
PARAMETER_PROMPT: Value
PARAMETER_DEFAULT:
PARAMETER_NAME: W
PARAMETER_TYPE: TEXT_ENCODED
PARAMETER_PROMPT: What stands behind
PARAMETER_DEFAULT:
PARAMETER_NAME: O
PARAMETER_TYPE: OPTIONAL OMITTABLE %(type)s
PARAMETER_PROMPT: Optional value
PARAMETER_DEFAULT:
TEMPLATE_START
FACTORY_DEF * TypedFactory FACTORY_NAME $(XFORMER_NAME) $(INPUT_LINES) VALUE $(V) AFTER $(W) OUTPUT OUTPUT FEATURE_TYPE $(XFORMER_NAME_ENCODED)|OUTPUT
FACTORY_OPTION $(XFORMER_NAME_ENCODED) LATER $(O)
FACTORY_DEF * TeeFactory FACTORY_NAME $(XFORMER_NAME_ENCODED)|OUTPUT_Router INPUT FEATURE_TYPE $(XFORMER_NAME_ENCODED)|OUTPUT OUTPUT FEATURE_TYPE $(OUTPUT_OUTPUT_FTYPE) $(OUTPUT_OUTPUT_FUNCS)
TEMPLATE_END
"""


def write_typed(reference, definitions, passive, folder):
    """A definition for each type that the reference lists and no shipped definition has."""
    used = {parameter.type for each in definitions for parameter in each.parameters}
    with open(reference, encoding="utf-8") as file:
        rows = re.findall(r"^\| `([A-Z_]+)` \| (yes|no) \| (?:yes|no) \|", file.read(), re.M)
    for kind, takes_config in rows:
        config = " 0%100%2" if kind.startswith("RANGE") else " A%B" if "CHOICE" in kind or "LISTBOX" in kind else \
            " Any|*" if kind.startswith("FILE") else " X" if kind.startswith("NAMED") else ' ""'
        if kind not in used and kind not in passive and "_PARM" not in kind:
            with open(os.path.join(folder, f"Typed{kind}.ort"), "w", encoding="utf-8") as file:
                file.write(TYPED % {"name": kind.replace("_", ""), "type": kind + config * (takes_config == "yes")})
