"""Workspaces put together at random, each with a harmless twin, and what an engine must find in them."""
import random
import re
from html import escape

from flow import origin
from functions import Feature
from values import CONFIG, LOOKUP, MEANS, NUMBERS, Value, encoded_text, is_encoded, level, make, reference
from words import decode, encode

HOSTILE = [
    "a b", " lead", "trail ", "two  blanks", "tab\there", '"', 'a"b', '"quoted"', 'a\\" b', "back\\", "c\\\\", "it's",
    "(", ")", "f(x", ")(", "g(x)", ",", "a,b", ";", "%", "#", "# c", "{", "}", "{}", "}{", "[", "]", "$x", "$(", "$[",
    '[puts "MACRO HIT 1"]', '"; puts "MACRO HIT 1"; #', "} ; puts {MACRO HIT 1}; {", "$(NOPE)", "$[NOPE]", "$(P1)",
    "$(XFORMER_NAME)", "$(INPUT_LINES)", "@", "@Value(", "@Value(a)", "@EvaluateExpression(", "@Tcl2(x", "INPUT",
    "OUTPUT", "FEATURE_TYPE", "1 OUTPUT X", "a OUTPUT x FEATURE_TYPE y", "FACTORY_DEF * TeeFactory", "MACRO HIT 1",
    'INCLUDE [ puts "MACRO HIT 1" ]', "line\nbreak", "\r", "<space>", "<", ">", "é", "日本", "😀", "\u00a0", "\u3000",
    "x" * 300, "END_INCLUDE", "# TRANSFORMER_END", "a|b", "a_OUTPUT", "%1", "&amp;", "0", "YES", "a:b", "\\n", "\\t",
    "]]>", "a/b", "a.b{0}", "<Unused>", "$(P0)", "$[P0]", "$($(P1))", "$(VALUE)", '"$(P0)","$(P1)"', "1e5", "1;2", "-",
    "@Count(x)", "b @Count(x)"]
# What statements make of the names of other nodes.
LIKENESSES = ["%s|x", "%s|TAG", "%s|TAG", "%s|TAG_Router", "%s_TAG", "%s_OUT0", "%s IN0 Input Collector",
              "OUT %s Output Renamer/Nuker", "OUT0 Collector"]
# Whole lines of headers, good and bad.
HEADERS = [
    "MACRO H one", "DEFAULT_MACRO H $(P0)", "MACRO H", "MACRO", "GUI TEXT H Prompt", "# a comment", "INCLUDE [ puts {MACRO H 2} ]",
    "INCLUDE [ puts {MACRO H 2}", "INCLUDE PYTHON\nreturn {'H': '1'}\nEND_INCLUDE", "INCLUDE PYTHON\nreturn {", "INCLUDE PYTHON",
    "INCLUDE TCL\nputs {MACRO H 1}\nEND_INCLUDE", "INCLUDE TCL\nset x {\nEND_INCLUDE", "END_INCLUDE", "# TRANSFORMER_END",
    "# TRANSFORMER_BEGIN X,1", "FACTORY_DEF *", 'FACTORY_DEF * TeeFactory FACTORY_NAME "x INPUT FEATURE_TYPE a', "MACRO H \\",
    "Tcl2 proc h {} {return 1}", "Tcl2 proc h {} {", "MACRO H $(H)", "MACRO P0 $(H)", "INCLUDE_CUSTOM_TRANSFORMER_VER Nope:1"]
# Tcl scripts that give "v1" of any word, or a value with a line break.
TCL = ["set x [list %s]\nreturn v1"] * 6 + [
    'set x "%s\\n"\nreturn [string range "v1" 0 end]', 'set x "\\n"\nset x v1\nset y %s\nset x',
    '# |\nreturn "%s\\nv1"', '# |\nset x {%s}\nappend x "\\r"\n$x', '# |\nset x [join [list %s v1] \\n]\nreturn $x']


def element(name, attributes, inner=""):
    text = "".join(f' {key}="{escape(value)}"' for key, value in attributes.items())
    for char, entity in (("\n", "&#10;"), ("\r", "&#13;"), ("\t", "&#9;")):
        text = text.replace(char, entity)
    return f"<{name}{text}>{inner}</{name}>\n" if inner else f"<{name}{text}/>\n"


def section(name, items):
    return f"<{name}>\n" + "".join(items) + f"</{name}>\n"


class Node:
    def __init__(self, number, name):
        self.number, self.name, self.values = number, name, {}
        self.definition = self.custom = None
        self.inputs, self.outputs = [], []


class Scope:
    """The workspace, or the inside of a custom transformer."""

    def __init__(self, name=""):
        self.name, self.nodes, self.links, self.parameters, self.ports = name, [], [], [], []
        self.copies = {}  # link -> the attributes that arrive under other names, and how each was called
        self.settings, self.names, self.numbers = {}, set(), 0
        self.attributes, self.referable, self.readers, self.writers = [], [], [], []
        self.loops, self.around = "", None

    def number(self):
        self.numbers += 1
        return self.numbers


class Case:
    """`seed` decides everything; `tame` puts a harmless text in the place of each hostile one."""

    def __init__(self, catalogue, seed, tame, skipped=(), dropped=()):
        self.random, self.tame, self.skipped, self.seed = random.Random(seed), tame, set(skipped), seed
        self.catalogue, self.feature, self.customs, self.used = catalogue, Feature(), [], []
        self.rate = self.random.choice([0.02, 0.05, 0.15])
        self.drawn, self.given = 0, []
        self.tags = sorted(tag for each in catalogue for tag in each.outputs)
        self.main = Scope()
        self.siblings = []
        self._fill(self.main, 0)
        self.header = [self.random.choice(HEADERS) for _ in range(self.random.choice([0] * 24 + [1, 2]))]
        self.linked = next((each for each in self.customs if each.around is self.main), None) \
            if self.random.random() < 0.1 else None
        if self.linked:
            self.linked.name += f" {seed}{'t' if tame else 'h'}"
        self.nodes = [(scope, node) for scope in [self.main, *self.customs] for node in scope.nodes]
        for scope, node in (self.nodes[at] for at in dropped):
            scope.nodes.remove(node)
            scope.links = [link for link in scope.links if node not in (link[0], link[2])]

    # --- texts

    def text(self, plain="t", where="value"):
        """A text: mostly harmless. Each draw has a number, so that single ones can be left out."""
        hostile, at = self.random.random() < self.rate, self.random.randrange(len(HOSTILE))
        self.drawn += 1
        if not hostile or self.drawn in self.skipped:
            return plain
        self.used.append((self.drawn, where, HOSTILE[at]))
        return f"h{at}" if self.tame else HOSTILE[at]

    def name(self, scope, plain, where):
        text = self.text(plain, where)
        alike = self.random.random() < self.rate and where not in ("attribute", "custom")
        mould, tag = self.random.choice(LIKENESSES), self.random.choice(self.tags)
        other = self.random.choice(["writer0", "Node 3", "Node 4", "Node 5", *self.given])
        self.drawn += 1
        if alike and self.drawn not in self.skipped:
            like = mould.replace("%s", encode(other) if "|" in mould else other).replace("TAG", tag)
            self.used.append((self.drawn, where, like))
            text = f"like{self.drawn}" if self.tame else like
        self.given.append(text)
        if text in scope.names:
            text += str(len(scope.names))
        scope.names.add(text)
        return text

    # --- scopes

    def _fill(self, scope, depth):
        rng = self.random
        for at in range(rng.randrange(3)):
            self._parameter(scope, at)
        if depth == 0:
            for at in range(rng.randint(1, 2)):
                node = Node(scope.number(), self.name(scope, f"reader{at}", "reader"))
                node.outputs = [""]
                scope.readers.append((node, self.text("DATA", "keyword") if rng.random() < 0.1 else "DATA"))
            for at in range(3):
                drawn = len(self.used)
                scope.attributes.append(self.name(scope, f"attr{at}", "attribute"))
                text = "".join(text for _, _, text in self.used[drawn:])
                if not re.search(r"\((?!.*\))|^\)", text):  # a reference names only what closes its parentheses
                    scope.referable.append(scope.attributes[-1])
        else:
            for at in range(rng.randint(1, 2)):
                self._port(scope, f"IN{at}", "true")
            for at in range(rng.randint(1, 2)):
                self._port(scope, f"OUT{at}", "false")
        if depth < 2:
            for at in range(rng.choice([0, 0, 1]) if depth else rng.choice([0, 0, 1, 1, 2])):
                self._custom(scope, depth)
        for _ in range(rng.randint(1, 4) if depth == 0 else rng.randint(1, 2)):
            self._place(scope)
        for custom in [each for each in self.customs if each.around is scope]:
            for _ in range(rng.randint(1, 2)):
                self._place(scope, custom)
        if depth == 0:
            for at in range(rng.randint(1, 2)):
                node = Node(scope.number(), self.name(scope, f"writer{at}", "writer"))
                node.inputs = [""]
                scope.writers.append((node, "OUT"))
        self._connect(scope)

    def _parameter(self, scope, at):
        rng = self.random
        scripts = ["SCRIPT", "TEXT_ENCODED"] if not scope.loops else []
        kind = rng.choice(["TEXT_ENCODED", "TEXT_EDIT", "PASSWORD_ENCODED", "TEXT", "FLOAT", "LOOKUP_CHOICE", *scripts])
        prompt = self.text("Prompt", "prompt")
        value = self.constant(kind, None if scope.name else scope)
        kind = value.kind if kind == "SCRIPT" else kind
        scope.parameters.append((f"P{at}", kind, prompt, value))

    def constant(self, kind, scope):
        """A value of a parameter of a document; what it refers to are the parameters of `scope`."""
        mixed = self.random.random() < 0.2
        same = [name for name, of, _, _ in scope.parameters
                if of == kind or kind == "TEXT_ENCODED" and is_encoded(of) or mixed and "TEXT" in kind] if scope else []
        if same and kind != "SCRIPT" and self.random.random() < 0.25:
            name = self.random.choice(same)
            return Value(f"$({name})", [("macro", name)])
        if kind == "FLOAT":
            number = self.random.choice(NUMBERS)
            return Value(number, number)
        if kind == "LOOKUP_CHOICE":
            return Value(*self.random.choice([(side, stored) for shown, stored in LOOKUP for side in (shown, stored)]))
        if kind == "SCRIPT":
            text, python = self.text("t", "script"), self.random.random() < 0.5
            code = (f"x = {text!r}\n# {text.splitlines()[0] if text.split() else ''}\nreturn 'v1'" if python else
                    self.random.choice(TCL) % encode(text))
            value = Value(encode(code), "v1", not python and "|" in code)
            value.kind = "TEXT_EDIT_PYTHON_PARM" if python else "TEXT_EDIT_TCL_PARM"
            return value
        if scope and scope.referable and self.random.random() < 0.01:
            name = self.random.choice(scope.referable)
            return Value(reference(name, kind == "TEXT_ENCODED"), self.feature.get(name))
        text = self.text("t", kind)
        if is_encoded(kind):
            return Value(*encoded_text(self, text, kind))
        return Value(text, None if any(mark in text for mark in MEANS) else text.strip(" \t"))

    def _port(self, scope, plain, kind):
        node = Node(scope.number(), self.name(scope, plain, "port"))
        node.inputs, node.outputs = ([], [""]) if kind == "true" else ([""], [])
        scope.ports.append((node, kind))

    def _custom(self, around, depth):
        rng = self.random
        custom = Scope(self.name(self.main, f"Custom {len(self.customs)}", "custom"))
        custom.around = around
        custom.settings = {"VERSION": str(rng.randint(1, 3)), "CATEGORY": self.text("Mine", "category"),
                           "GUID": self.text("{1234}", "guid") if rng.random() < 0.2 else "{1234}"}
        self.customs.append(custom)
        mode = rng.random()
        custom.loops = "loop" if mode < 0.2 else "workers" if mode < 0.4 else ""
        if mode < 0.2:
            custom.settings["BLOCKED_LOOPING"] = "yes"
        elif mode < 0.4:
            custom.settings["PARALLELISM"] = self.text(rng.choice(["MINIMAL", "EXTREME"]), "parallel")
            custom.settings["PARALLEL_GROUP_BY"] = (
                self.text("attr", "parallel") if rng.random() < 0.2 else self.main.attributes[0])
        self._fill(custom, depth + 1)
        if custom.loops == "loop":
            node = Node(custom.number(), "AGAIN")
            node.inputs, node.outputs = [""], [""]
            custom.ports.append((node, "loop"))
            sources = [each for each in custom.nodes if each.outputs]
            if sources:
                source = rng.choice(sources)
                self._link(custom, source, rng.choice(source.outputs), node, "")
                if source.inputs:
                    self._link(custom, node, "", source, rng.choice(source.inputs))

    def _place(self, scope, custom=None):
        rng = self.random
        if custom:
            node = Node(scope.number(), self.name(scope, f"Instance{scope.numbers}", "instance"))
            node.custom = custom
            node.inputs = [port.name for port, kind in custom.ports if kind == "true"]
            node.outputs = [port.name for port, kind in custom.ports if kind == "false"]
            for name, kind, _, default in custom.parameters:
                node.values[name] = default if rng.random() < 0.3 or kind.endswith("_PARM") or default.fixed else \
                    self.constant(kind, scope)
            if custom.loops == "loop":
                node.values["MAX_LOOP_ITERATIONS"] = Value(
                    self.text("9", "loop setting") if rng.random() < 0.2 else rng.choice(NUMBERS[3:]))
                node.values["ITERATION_COUNT_ATTR"] = Value(self.text("turn", "loop setting"))
        else:
            node = Node(scope.number(), self.name(scope, f"Node {scope.numbers}", "name"))
            typed = rng.random() < 0.2
            node.definition = rng.choice([each for each in self.catalogue if each.name.startswith("Typed") == typed])
            node.inputs, node.outputs = list(node.definition.inputs), list(node.definition.outputs)
            self.siblings = [parameter.name for parameter in node.definition.parameters]
            for parameter in node.definition.parameters:
                value = make(self, parameter, scope)
                if value is not None:
                    node.values[parameter.name] = value
            if node.definition.grouped and rng.random() < 0.3:
                node.values["ORX_PROCESS_COUNT"] = level(self, scope)
        scope.nodes.append(node)

    def _connect(self, scope):
        """Every node is fed by what stands before it; outputs of documents and writers by anything."""
        rng = self.random
        before = [node for node, _ in scope.readers] + [node for node, kind in scope.ports if kind == "true"]
        ends = [node for node, _ in scope.writers] + [node for node, kind in scope.ports if kind == "false"]
        for node in scope.nodes + ends:
            giving = [each for each in before if each.outputs]
            for port in node.inputs:
                for source in rng.sample(giving, min(len(giving), rng.choice([1, 1, 1, 2]))):
                    self._link(scope, source, rng.choice(source.outputs), node, port)
            if node not in ends:
                before.append(node)

    def _link(self, scope, *link):
        rng = self.random
        scope.links += [link] * (2 if rng.random() < 0.01 else 1)
        known = scope is not self.main or any(link[0] is reader for reader, _ in scope.readers)
        if known and rng.random() < 0.2:
            names = list(self.main.attributes)
            given = rng.sample(names, rng.randint(1, 3))
            if not any(link[2] is writer for writer, _ in scope.writers) and rng.random() < 0.5:
                given.append(self.text("copy", "attribute"))
            scope.copies[link] = {name: rng.choice(names) for name in given}

    # --- the document

    def document(self, embeds=True):
        """The workspace; what is linked stands inside as well when it `embeds`."""
        main, subs = self.main, ""
        self.embeds = embeds
        placed = {id(node.custom) for scope in [main, *self.customs] for node in scope.nodes}
        for custom in self.customs:
            inside = custom
            while inside.around is not main and inside is not self.linked:
                inside = inside.around
            if id(custom) not in placed or inside is self.linked and not embeds:
                continue
            subs += element("SUBDOCUMENT", {"NAME": custom.name, **custom.settings}, self._sections(custom))
        types = ""
        for nodes, source in ((main.readers, "true"), (main.writers, "false")):
            for node, keyword in nodes:
                inner = "".join(element("FEAT_ATTRIBUTE", {"ATTR_NAME": name}) for name in main.attributes)
                types += element("FEATURE_TYPE", {"IS_SOURCE": source, "FEATURE_TYPE_NAME": node.name,
                                                  "KEYWORD": keyword, "IDENTIFIER": str(node.number)}, inner)
        xml = ('<?xml version="1.0" encoding="UTF-8" ?>\n<WORKSPACE>\n' + section("FEATURE_TYPES", [types]) +
               self._sections(main) + section("SUBDOCUMENTS", [subs]) + "</WORKSPACE>\n")
        return "".join(f"#! {line}\n" for line in xml.split("\n") if line) + "".join(
            f"{line}\n" for line in ["#! START_HEADER", *self.header, "#! END_HEADER"])

    def _sections(self, scope):
        nodes = []
        for node in scope.nodes:
            values = {"XFORMER_NAME": node.name, **{key: value.stored for key, value in node.values.items()}}
            linked = node.custom and node.custom is self.linked and not self.embeds
            kind = {"TYPE": node.definition.name, "VERSION": str(node.definition.version)} if node.definition else {
                "TYPE": node.custom.name if linked else "SubDocumentTransformer",
                "VERSION": node.custom.settings["VERSION"]}
            if node.custom and not linked:
                values["SUB_DOC_NAME"] = node.custom.name
            nodes.append(element("TRANSFORMER", {"IDENTIFIER": str(node.number), **kind}, "".join(
                [element("OUTPUT_FEAT", {"NAME": each}) for each in node.outputs] +
                [element("XFORM_PARM", {"PARM_NAME": key, "PARM_VALUE": value}) for key, value in values.items()])))
        links = [element("FEAT_LINK", {
            "IDENTIFIER": str(1000 + at), "SOURCE_NODE": str(a.number), "TARGET_NODE": str(b.number),
            "SOURCE_PORT_DESC": f"fo {a.outputs.index(out)} {encode(out)}".strip(),
            "TARGET_PORT_DESC": f"fi {b.inputs.index(into)} {encode(into)}".strip()})
            for at, (a, out, b, into) in enumerate(scope.links)]
        copies = [element("ATTR_LINK", {
            "IDENTIFIER": "5000", "SOURCE_NODE": str(a.number), "TARGET_NODE": str(b.number),
            "SOURCE_PORT_DESC": f"ao {a.outputs.index(out)} 0 {encode(old)}",
            "TARGET_PORT_DESC": f"ai {b.inputs.index(into)} 0 {encode(new)}"})
            for (a, out, b, into), names in scope.copies.items() for new, old in names.items()
            if (a, out, b, into) in scope.links]
        ports = [element("SUBDOCUMENT_IO", {"IDENTIFIER": str(node.number), "NAME": node.name, "IS_SOURCE": kind})
                 for node, kind in scope.ports]
        parameters = [element("GLOBAL_PARAMETER", {"GUI_LINE": f"GUI {kind} {name} {CONFIG.get(kind, '')}{prompt}",
                                                   "DEFAULT_VALUE": value.stored})
                      for name, kind, prompt, value in scope.parameters]
        return section("GLOBAL_PARAMETERS", parameters) + section("TRANSFORMERS", nodes) + (
            section("SUBDOCUMENT_IOS", ports) if ports else "") + section("FEAT_LINKS", links) + section(
                "ATTR_LINKS", copies)

    def broken(self):
        """What must not be written."""
        scopes = [self.main]
        for scope in scopes:
            scopes += [node.custom for node in scope.nodes if node.custom and node.custom not in scopes]
        values = [value for scope in scopes for node in scope.nodes for value in node.values.values()]
        return [each.stored for each in values + [value for *_, value in self.main.parameters] if each.broken]

    # --- what an engine must find

    def readers(self):
        return {(keyword, node.name) for node, keyword in self.main.readers}

    def instances(self):
        """All plain transformers: their name to the engine, the node, and the scopes around it."""
        def walk(scope, prefix, around):
            for node in scope.nodes:
                if node.custom:
                    yield from walk(node.custom, prefix + node.name + "_", around + [(scope, node)])
                else:
                    yield prefix + node.name, node, scope, around
        return walk(self.main, "", [])

    def sources(self, scope, around, node, port):
        """What is to arrive at a port, as the engine names it, with the names that attributes had before."""
        found, pending, seen = set(), [(scope, around, node, port, {})], set()
        while pending:
            scope, around, node, port, later = pending.pop()
            if (key := (*(id(each) for _, each in around), id(node), port, *sorted(later.items()))) in seen:
                continue
            seen.add(key)
            for source, out, target, into in scope.links:
                if target is not node or into != port:
                    continue
                given = scope.copies.get((source, out, target, into), {})
                names = {**given, **{new: given.get(old, old) for new, old in later.items()}}
                names = {new: old for new, old in names.items() if new != old or new in given}
                prefix = "".join(each.name + "_" for _, each in around)
                if source.custom:
                    inner = next(each for each, kind in source.custom.ports if each.name == out and kind == "false")
                    pending.append((source.custom, around + [(scope, source)], inner, "", names))
                elif source.definition:
                    found.add(origin(decode(prefix + encode(source.name) + "|" + encode(out)), names))
                elif any(source is reader for reader, _ in scope.readers):
                    found.add(origin(("", source.name), names))
                elif any(source is each and kind == "loop" for each, kind in scope.ports):
                    pending.append((scope, around, source, "", names))
                else:
                    outer, instance = around[-1]
                    pending.append((outer, around[:-1], instance, source.name, names))
        return found
