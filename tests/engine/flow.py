"""Factories, their clauses, and what flows between them (sections 4 and 9 of the reference)."""
import re
from collections import namedtuple

from words import Fault, decode, split, unquote

SETTINGS = {"PARALLELISM": "NO_PARALLELISM|MINIMAL|MODERATE|AGGRESSIVE|EXTREME", "PROCESS_SETTING": "Yes|No",
            "MAX_LOOP_ITERATIONS": "[0-9]*", "RUN": "STATEMENTS|DEFINITION"}
Input = namedtuple("Input", "port type filter")
Output = namedtuple("Output", "port type functions")


class Factory:
    def __init__(self, kind, name):
        self.kind, self.name = kind, name
        self.inputs, self.outputs = [], []
        self.settings = []  # key and value as they stand, references expanded
        self.reached = {}   # input port -> what reaches it

    def values(self, key):
        return [value for each, value in self.settings if each == key]

    def shape(self):
        """All that values and names must not change."""
        return (self.kind.split(":")[0], tuple((bool(i.filter),) for i in self.inputs), tuple(
            key for key, _ in self.settings), tuple(
                tuple(re.match(r"@?\w*", f)[0] for f in o.functions) for o in self.outputs))


def factory(text, macros, keys):
    """The factory of a FACTORY_DEF statement; `keys` gives the keys of a kind."""
    is_fact = re.match(r"\s*FACTORY_DEF\s+\*\s+TransformFact:", text)
    words = split(text, keyed=bool(is_fact))
    raw = [word.raw for word in words]
    if not all(word.closed for word in words):
        raise Fault("a quote or call has no end")
    if raw[1:2] != ["*"] or raw[3:4] != ["FACTORY_NAME"] or len(raw) < 5:
        raise Fault("no FACTORY_DEF")

    def plain(at):
        return macros.expand(unquote(raw[at])) if at < len(raw) else ""

    made = Factory(raw[2], plain(4))
    at, known = 5, keys(raw[2])
    if is_fact:
        at = _meta(made, raw, macros)
    while at < len(raw):
        if raw[at] in ("INPUT", "OUTPUT"):
            with_port = raw[at + 1:at + 2] != ["FEATURE_TYPE"]
            place = at + (2 if with_port else 1)
            if raw[place:place + 1] != ["FEATURE_TYPE"] or place + 1 >= len(raw):
                raise Fault("a clause lacks its FEATURE_TYPE: " + text[words[at].start:][:80])
            port, kind = (plain(at + 1) if with_port else ""), plain(place + 1)
            end = place + 2
            while end < len(raw) and raw[end].startswith("@"):
                end += 1
            functions = [macros.expand(each) for each in raw[place + 2:end]]
            if raw[at] == "INPUT":
                if made.outputs or len(functions) > 1:
                    raise Fault("an INPUT clause behind OUTPUT clauses, or with two filters")
                made.inputs.append(Input(port, kind, "".join(functions)))
            else:
                made.outputs.append(Output(port, kind, functions))
            at = end
            continue
        if made.outputs or raw[at] not in known:
            raise Fault(f"no clause: {raw[at][:60]}")
        end = at + 1
        while end < len(raw) and raw[end] not in known and raw[end] not in ("INPUT", "OUTPUT"):
            end += 1
        value = text[words[at + 1].start:words[end - 1].end] if end > at + 1 else ""
        expand = macros.expand_inner if raw[at] == "PARAMETERS" else macros.expand
        made.settings.append((raw[at], expand(value)))
        at = end
    return made


def _meta(made, raw, macros):
    if raw[5:6] != ["FACTORY_META_PARAMS"]:
        raise Fault("no FACTORY_META_PARAMS")
    kind, version, name = (made.kind.split(":", 2) + ["", ""])[:3]
    made.kind = ":".join([kind, version, unquote(name)])
    at = 6
    while at < len(raw) and raw[at] not in ("INPUT", "OUTPUT"):
        key, colon, value = raw[at].partition(":")
        if not colon or not re.fullmatch("[A-Z_]+", key):
            raise Fault("no setting KEY:VALUE: " + raw[at][:60])
        made.settings.append((key, macros.expand(unquote(value))))
        if not re.fullmatch(SETTINGS.get(key, "(?s:.*)"), made.settings[-1][1]):
            raise Fault(f"{key} is {made.settings[-1][1][:60]!r}")
        at += 1
    return at


def origin(place, names=()):
    """Where features come from, and which of their attributes were others there: name and name there."""
    return place, frozenset((name, old) for name, old in dict(names).items() if name != old)


def copied(came, functions):
    """An origin behind the functions of an output."""
    names = dict(came[1])
    for call in filter(None, (re.fullmatch(r"(?s)@CopyAttribute\((.*)\)", each) for each in functions)):
        words = [decode(word) for word in call[1].split(",")]
        names.update({new: names.get(old, old) for new, old in zip(words[::2], words[1::2])})
    return origin(came[0], names)


class Flow:
    """Which outputs of which factories each feature type carries."""

    def __init__(self, types):
        self.types = {name: set(origins) for name, origins in types.items()}
        self.taken = set()

    def pass_through(self, made):
        reached = set()
        for port, kind, _ in made.inputs:
            origins = self.types.get(kind, set())
            made.reached.setdefault(port, set()).update(origins)
            reached |= origins
            self.taken.add(kind)
        for _, kind, functions in made.outputs:
            self.types.setdefault(kind, set()).update(
                copied(each, functions)
                for each in (reached if made.kind == "TeeFactory" else [origin(decode(kind))]))
