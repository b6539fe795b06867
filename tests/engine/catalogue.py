"""What the definition files say: ports, parameters, and which key of which factory carries which parameter."""
import glob
import os

from words import split


class Definition:
    def __init__(self):
        self.name, self.version, self.inputs, self.outputs = "", 0, [], []
        self.aliases, self.parameters, self.hidden = {}, [], []
        self.kind, self.statements = "", []
        self.multiprocess = ""

    def keys_of(self, parameter):
        return [key for key, value in self.statements if value == f"$({parameter})"]


class Parameter:
    def __init__(self, name):
        self.name, self.flags, self.type, self.config, self.prompt, self.default = name, [], "", "", "", ""

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
        elif keyword == "VERSION:":
            current.version = int(value)
        elif keyword == "MULTIPROCESS:":
            current.multiprocess = value
        elif keyword == "PARAMETER_NAME:":
            current.parameters.append(Parameter(value))
        elif keyword == "PARAMETER_TYPE:":
            current.parameters[-1].read_type(value)
        elif keyword == "PARAMETER_PROMPT:":
            current.parameters[-1].prompt = value
        elif keyword == "PARAMETER_DEFAULT:":
            current.parameters[-1].default = value
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
