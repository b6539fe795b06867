"""An engine that reads a mapping file as its reference says, and tells what it found."""
import glob
import os
import re

import flow
import scripts
from functions import evaluate
from macros import Macros
from statements import definition, parts
from words import Fault, decode, split, unpack, unquote

PREFIX_CHARS = re.compile(r"[ &,@\\/]")


def prefix_macro(transformer):
    return PREFIX_CHARS.sub("_", transformer) + "_WORKSPACE_NAME"


class Run:
    """One mapping file, read from its first statement to its last."""

    def __init__(self, engine, text, readers):
        self.engine, self.macros = engine, Macros()
        self.factories, self.shapes, self.faults, self.unknown = [], [], [], []
        self.workers = {}  # name of a factory of several processes -> the flow inside its workers, what leaves
        self.entering = {reader: reader[1] for reader in readers}  # the flow that each type of a reader enters as
        self.flow, self.writers, self.depth = flow.Flow({}), {}, 0
        self.enter()
        engine.tcl.fresh()
        self.read(text, [])

    def read(self, text, around):
        self.depth += 1
        if self.depth > 80:
            raise Fault("definitions inside one another without end")
        statements, blocks = parts(text)
        blocks += around
        at = 0
        while at < len(statements):
            body, line = statements[at]
            at += 1
            lines = []
            if body.strip() in ("INCLUDE PYTHON", "INCLUDE TCL"):
                while at < len(statements) and statements[at].text.strip() != "END_INCLUDE":
                    lines.append(statements[at].text)
                    at += 1
                at += 1
            try:
                self.statement(body.strip(" \t"), lines, blocks)
            except Fault as fault:
                self.faults.append(f"line {line}: {fault}")
            except (IndexError, ValueError, RecursionError) as error:
                self.faults.append(f"line {line}: {type(error).__name__} {error}: {body[:120]}")
        self.depth -= 1

    def statement(self, body, lines, blocks):
        keyword, _, rest = re.sub(r"^(\S+)[ \t]*", "\\1\n", body).partition("\n")
        self.shapes.append(keyword)
        if keyword in ("MACRO", "DEFAULT_MACRO"):
            name, value = (re.split(r"[ \t]+", rest, maxsplit=1) + [""])[:2]
            name = self.macros.expand(name)
            if keyword == "MACRO" or name not in self.macros:
                self.macros[name] = self.macros.expand_early(value.strip(" \t"))
        elif body == "INCLUDE PYTHON":
            self.macros.update(scripts.run_python(lines, self.macros))
        elif body == "INCLUDE TCL":
            self.written(self.engine.tcl.run("include", "\n".join(lines), self.macros)[1], blocks)
        elif keyword == "INCLUDE" and rest.startswith("["):
            script = self.macros.expand(rest[1:rest.rindex("]")])
            self.written(self.engine.tcl.run("include", script)[1], blocks)
        elif keyword == "INCLUDE":
            with open(self.macros.expand(unquote(rest)), encoding="utf-8") as file:
                self.read(file.read(), blocks)
        elif keyword == "Tcl2":
            self.engine.tcl.run("each", self.macros.expand(rest))
        elif keyword in ("INCLUDE_CUSTOM_TRANSFORMER_VER", "INCLUDE_BUILTIN_CUSTOM_TRANSFORMER_VER"):
            self.include(self.macros.expand(rest.strip()), blocks)
        elif keyword == "FACTORY_DEF":
            self.factory(flow.factory(body, self.macros, self.engine.keys), blocks)
        elif keyword == "FACTORY_OPTION":
            self.option(rest)
        elif keyword in ("READER_FEATURE_TYPE", "WRITER_FEATURE_TYPE"):
            self.route(keyword, [self.macros.expand(unquote(word.raw)) for word in split(rest)])
        elif keyword == "GUI":
            self.macros.prompted.update(rest.split())
        else:
            self.unknown.append(body)

    def written(self, lines, blocks):
        for line in lines:
            self.read(line, blocks)

    def include(self, wanted, blocks):
        name, _, version = wanted.rpartition(":")
        found = definition(blocks, name, version)
        found = self.engine.linked(name, version) if found is None else found
        if found is None:
            raise Fault("no definition of " + wanted)
        self.read(found, blocks)

    def route(self, keyword, words):
        if len(words) != 3:
            raise Fault(f"{keyword} has {len(words)} words")
        if keyword == "READER_FEATURE_TYPE":
            if tuple(words[:2]) not in self.entering:
                raise Fault(f"no reader {words[:2]}")
            self.entering[tuple(words[:2])] = words[2]
            self.enter()
        else:
            self.writers[words[0], words[2]] = words[1]

    def enter(self):
        self.flow.types = {}
        for (_, kind), entered in self.entering.items():
            self.flow.types.setdefault(entered, set()).add(flow.origin(("", kind)))

    def option(self, rest):
        words = split(rest)
        if len(words) < 2 or not re.fullmatch("[A-Z0-9_]+", words[1].raw):
            raise Fault("no FACTORY_OPTION: " + rest[:80])
        name = self.macros.expand(words[0].raw)
        owner = next((each for each in reversed(self.factories)
                      if decode(name) in (each.name, decode(each.name))), None)
        if owner is None:
            raise Fault("an option for a factory that is not there: " + name)
        key = words[1].raw
        expand = self.macros.expand_inner if key == "PARAMETERS" else self.macros.expand
        owner.settings.append((key, expand(rest[words[2].start:words[-1].end] if words[2:] else "")))
        self.shapes.append((owner.kind, key))

    def factory(self, made, blocks):
        self.shapes[-1] = made.shape()
        self.factories.append(made)
        worker = next((each for name, each in self.workers.items()
                       if made.name == name or decode(made.name).startswith(name + "|")), None)
        if worker:
            worker[0].pass_through(made)
            self.hand_out(worker[0], worker[1])
            return
        if not made.kind.startswith("TransformFact:"):
            self.flow.pass_through(made)
            return
        outer, settings = self.flow, dict(made.settings)
        types = {kind: outer.types.get(kind, set()) for _, kind, _ in made.inputs}
        outer.taken.update(types)
        if settings.get("RUN") == "STATEMENTS":
            self.workers[made.name] = flow.Flow(types), [kind for _, kind, _ in made.outputs]
            return
        _, version, name = made.kind.split(":", 2)
        prefix = prefix_macro(name)
        listed = unpack(settings.get("TRANSFORMER_PARAMS", ""))
        self.macros[prefix] = made.name
        for key, value in zip(listed[::2], listed[1::2]):
            self.macros[made.name + "_" + decode(key)] = self.macros.expand_early(decode(value))
        back = made.name + "_" + settings.get("LOOPBACK_INPUT_TAG", "")
        count, workers = len(self.factories), self.workers
        came, before = None, ()
        while before != came and ("LOOPBACK_INPUT_TAG" in settings or came is None):
            before = came
            del self.factories[count:]
            self.workers = dict(workers)
            self.flow = inner = flow.Flow(types)
            self.include(f"{name}:{version}", blocks)
            came = inner.types.get(f"{made.name}_{settings.get('LOOPBACK_OUTPUT_TAG', '')}", set())
            types = {**types, back: types.get(back, set()) | came}
        self.flow = outer
        self.hand_out(inner, [kind for _, kind, _ in made.outputs])

    def arriving(self, keyword, kind):
        """What reaches a feature type of a writer."""
        return self.flow.types.get(self.writers.get((keyword, kind), kind), set())

    def value(self, text, feature):
        return evaluate(text, feature, self.engine.tcl)

    def unfed(self):
        return [f"{made.name}: nothing flows in as {kind}" for made in self.factories if made.kind != "TeeFactory"
                for port, kind, _ in made.inputs if made.reached and not any(made.reached.values())]

    def complaints(self, feature):
        """Everything that an engine would stumble over."""
        found = self.faults + [f"no such macro: {name}" for name in sorted({*self.macros.unset, *(set(self.macros.early) - set(self.macros))} - self.macros.prompted)]
        found += ["no statement: " + body[:80] for body in self.unknown]
        for made in self.factories:
            if made.kind != "TeeFactory" and not made.kind.startswith("TransformFact:"):
                for key, text in made.settings:
                    try:
                        self.value(text, feature)
                    except Fault as fault:
                        found.append(f"{made.name}: {key}: {fault}")
        return found

    def hand_out(self, inner, kinds):
        for kind in kinds:
            self.flow.types.setdefault(kind, set()).update(inner.types.get(kind, set()))


class Engine:
    def __init__(self, kinds, folders):
        self.kinds, self.folders, self.files = kinds, folders, None
        self.tcl = scripts.Tcl()

    def keys(self, kind):
        return self.kinds.get(kind, set())

    def linked(self, name, version):
        if self.files is None:
            self.files = []
            for path in sorted(path for folder in self.folders
                               for path in glob.glob(os.path.join(folder, "**", "*.ort"), recursive=True)):
                with open(path, encoding="utf-8") as file:
                    text = file.read()
                if "# TRANSFORMER_BEGIN " in text:
                    self.files += parts(text)[1]
        return definition(self.files, name, version)
