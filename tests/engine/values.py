"""Values for parameters of every type, and what each is to come back as."""
import json
import re
from html import escape

from catalogue import Parameter
from words import decode, encode, pack, unpack

# What is no text as it stands in a value that is not encoded, but a reference, a call or a mark.
MEANS = ("$(", "$[", "@", "<U")
NUMBERS = ["0", "1", "-3", "25", "100"]
PASSIVE = ("DISCLOSUREGROUP", "GROUP", "NAMEDGROUP", "DIVIDER", "MESSAGE", "PUBLISHED_PARAMETER",
           "PUBLISHED_PARAMETER_LIST", "TEXT_EDIT_PYTHON_PARM", "TEXT_EDIT_TCL_PARM")
WITH_CONFIG = ("ATTR", "CHOICE", "LISTBOX", "LOOKUP", "CHECKBOX", "FILE", "NAMED", "RANGE", "TEXT_EDIT_PARM")
LOOKUP = [("First one", "ONE"), ("Second, one", "TWO"), ("THREE", "3")]
CONFIG = {"LOOKUP_CHOICE": '"First one",ONE%"Second, one",TWO%THREE,3 '}
LEVELS = {"No Parallelism": "NO_PARALLELISM", "Minimal": "MINIMAL", "Extreme": "EXTREME"}


class Value:
    """A stored value, and what it is to come back as: None where nothing is to be compared."""

    def __init__(self, stored, expected=None, broken=False):
        self.stored, self.expected = stored, expected
        self.fixed = False  # whether instances keep it
        self.broken = broken  # whether nothing may be written with it
        self.unfit = False  # whether it has to be refused


def is_encoded(kind):
    return kind.endswith("_ENCODED") or kind.startswith("TEXT_EDIT")


def encoded_text(case, text, kind):
    """The stored form and what it means; now and then nobody encoded it, which is refused or read as it stands."""
    if case.random.random() < 0.05:
        return text, None if any(mark in text for mark in ("$(", "$[", "@Value")) else decode(text)
    return as_text(text) if may_refer(kind) else encode(text), text


def as_text(text):
    """Where a wholly encoded reference is one, the same letters are spelt with a number."""
    return encode(text).replace("<commercialat>Value<leftparenthesis>", "<u0040>Value<leftparenthesis>")


def may_refer(kind):
    return "_OR_ATTR" in kind


def entries(parameter):
    """Shown and stored sides of the choices."""
    found = []
    for entry in unpack(parameter.config, "%"):
        sides = unpack(entry, ",") if parameter.type.startswith("LOOKUP_") else [entry]
        found.append((sides[0], parameter.stored_side(sides[-1])))
    return found


def make(case, parameter, scope):
    """None leaves the parameter to its default."""
    rng, kind = case.random, parameter.type
    if kind in PASSIVE or not kind:
        return None
    if "OPTIONAL" in parameter.flags and parameter.name != "LABEL" and rng.random() < 0.3:
        return unset(parameter) if rng.random() < 0.1 else Value("", "")
    if rng.random() < 0.003:
        return unset(parameter)
    if kind == "GUI_LINE_TABLE":
        return table(case, parameter, scope)
    if kind == "MULTIPARAMETER":
        return multi(case, parameter, scope)
    if rng.random() < 0.01 and not scope.name and kind != "CHECKBOX":
        value = referred(case, scope, "OPTIONAL TEXT", "", "")
        value.expected, value.unfit = None, "OPTIONAL" not in parameter.flags
        return value
    if "CHOICE" in kind or "LISTBOX" in kind or kind == "CHECKBOX":
        return choice(case, parameter, scope)
    if kind.startswith(("INT", "FLOAT", "RANGE")):
        return numeric(case, kind, scope)
    if kind.startswith("EXPRESSION"):
        return expression(case, scope)
    if "ATTR" in kind.split("_") and "OR" not in kind.split("_"):
        return attributes(case, kind, scope)
    return text(case, kind, scope)


def choice(case, parameter, scope):
    rng, kind = case.random, parameter.type
    if kind == "CHECKBOX":
        stored = rng.choice(parameter.config.split("%") if parameter.config else ["YES", "NO"])
        return Value(stored, stored)
    sides = entries(parameter)
    if not sides:
        return None
    if "LISTBOX" in kind:
        picked = rng.sample(sides, rng.randint(1, len(sides)))
        at = rng.randrange(2)
        given, stored = pack([side[at] for side in picked], " "), pack([side[1] for side in picked], " ")
    else:
        shown, stored = rng.choice(sides)
        if rng.random() < 0.05:
            wrong = case.text(stored, "choice")
            return Value(wrong, stored if wrong == stored else None)
        given = shown if parameter.lookup else rng.choice([shown, stored])
    if rng.random() < 0.05 and scope.referable:
        return conditional(case, kind, scope, [(given, stored)] * 2)
    return referred(case, scope, "TEXT", given, stored) if rng.random() < 0.1 else Value(given, stored)


def referred(case, scope, kind, given, expected):
    """A reference to a parameter made for it, whose value is `given`."""
    name = f"R{len(scope.parameters)}"
    kind = case.random.choice([kind, kind, "TEXT_ENCODED"])
    value = Value(encode(given) if is_encoded(kind) else given, given)
    value.fixed = True
    scope.parameters.append((name, kind, "Prompt", value))
    return Value(f"$({name})", [expected])


def level(case, scope):
    shown, stored = case.random.choice(list(LEVELS.items()))
    given = case.text(case.random.choice([shown, stored]), "parallel")
    if given not in (shown, stored):
        return Value(given)
    if case.random.random() < 0.1 and scope.referable:
        return conditional(case, "CHOICE", scope, [(given, stored)] * 2)
    return referred(case, scope, "TEXT", given, stored) if case.random.random() < 0.2 else Value(given, stored)


def numeric(case, kind, scope):
    rng = case.random
    if rng.random() < 0.1:
        wrong = case.text("1", "number")
        return Value(wrong, None)
    if may_refer(kind) and scope.referable and rng.random() < 0.4:
        name = scope.referable[0]
        return Value(reference(name, is_encoded(kind)), case.feature.get(name))
    number = rng.choice(NUMBERS[3:])
    if may_refer(kind) and scope.referable and case.siblings and rng.random() < 0.05:
        sum_of = f"{reference(scope.referable[0], is_encoded(kind))}+$({rng.choice(case.siblings)})"
        return Value(sum_of)  # what it gives is not compared; that it can be worked out is
    if rng.random() < 0.05:
        return referred(case, scope, "FLOAT", number, number)
    if rng.random() < 0.05:
        value = referred(case, scope, "TEXT", given := case.text(number, "referred number"), given)
        value.unfit = not scope.name and not any(mark in given for mark in ("$", "<Unused>")) and not number_in(given)
        return value
    return Value(number, number)


def number_in(text):
    return re.fullmatch(r"[-+]?(\d+\.?\d*|\.\d+)(e[-+]?\d+)?", text.strip(), re.ASCII | re.IGNORECASE)


def reference(name, encoded):
    """The reference to an attribute as a person's tools write it: names that would end it stand in quotes."""
    quoted = '"' + name.replace('"', '\\"') + '"' if any(char in '(){}"' for char in name) else name
    whole = "(" + quoted + ")"
    return "@Value" + (encode(whole) if encoded else whole)


def text(case, kind, scope):
    rng, encoded = case.random, is_encoded(kind)
    mixed = rng.random() < 0.1
    macros = [(name, value) for name, of, _, value in scope.parameters
              if mixed or (is_encoded(of) or of.endswith("_PARM")) == encoded and of != "FLOAT"]
    meaning = shaped(kind, case.text("t", kind))
    stored, meant = encoded_text(case, meaning, kind) if encoded else (meaning, meaning)
    expected = None if not encoded and any(mark in meaning for mark in MEANS) else meant
    parts = [(stored, expected)]
    if may_refer(kind) and scope.referable and rng.random() < 0.3:
        name = rng.choice(scope.referable)
        parts.insert(rng.randrange(2), (reference(name, encoded), case.feature.get(name)))
        if not encoded:
            parts = [(part, None) for part, _ in parts]
    elif macros and rng.random() < 0.4:
        name, value = rng.choice(macros)
        parts.append((f"$({name})", ("macro", name)))
    elif rng.random() < 0.1 and scope.referable and (may_refer(kind) or shaped(kind, "") != ""):
        results = [shaped(kind, case.text(plain, "conditional")) for plain in ("yes", "no")]
        broken = shaped(kind, "") != "" and rng.random() < 0.2
        if broken:
            results[rng.randrange(2)] = "<a>{"
        value = conditional(case, kind, scope, [(text, text) for text in results])
        value.broken = broken
        return value
    if case.siblings and rng.random() < 0.05:
        parts.append(own(case))
        rng.shuffle(parts)
    values = [meaning for _, meaning in parts]
    return Value("".join(part for part, _ in parts), None if None in values else values)


def shaped(kind, text):
    """The text as one that is well formed in the language of the type."""
    return f"<a>{escape(text)}</a>" if "XML" in kind else json.dumps(text) if "JSON" in kind else text


def conditional(case, kind, scope, results):
    """`results` are what is given, and what is to come back, of a condition that holds and of one that does not."""
    name = case.random.choice(scope.referable)
    limit = case.random.choice(["0", "99999"])
    (yes, first), (no, second) = results
    condition = encode("@Value(" + reference(name, False)[7:-1] + ") > ")
    if case.siblings and case.random.random() < 0.1:
        return Value("ORX_CONDITIONAL:" + ";".join([condition + own(case)[0], as_text(yes), as_text(no)]))
    condition += encode(limit)
    return Value("ORX_CONDITIONAL:" + ";".join([condition, as_text(yes), as_text(no)]),
                 [first if float(case.feature.get(name)) > float(limit) else second])


def own(case):
    """A reference to another parameter of the same transformer, and what it is to give."""
    name = case.random.choice(case.siblings)
    return (f"$[{name}]", None) if case.random.random() < 0.05 else (f"$({name})", ("own", name))


def expression(case, scope):
    if scope.referable and case.random.random() < 0.05:
        name, limit = scope.referable[0], case.random.choice(["0", "99999"])
        formulas = [f"{reference(name, False)} + {number}" for number in (1, 2)]
        return Value("ORX_CONDITIONAL:" + ";".join(map(encode, (f"{reference(name, False)} > {limit}", *formulas))),
                     ("formula", [formulas[limit != "0"]]))
    rng, parts = case.random, ["1 = 2"]
    if scope.referable:
        parts = ["@Value(" + reference(rng.choice(scope.referable), False)[7:-1] + ") = 3"]
    stored = encode(parts[0])
    encoded = [name for name, kind, _, _ in scope.parameters if kind == "TEXT_ENCODED"]
    if rng.random() < 0.3:
        parts.append(' or "' + case.text("t", "formula").replace('"', '""') + '" = "t"')
        stored += encode(parts[-1])
    elif encoded and rng.random() < 0.3:
        parts += [' or "', ("macro", encoded[0]), '" = "t"']
        stored += encode(' or "') + f"$({encoded[0]})" + encode('" = "t"')
    if case.siblings and rng.random() < 0.1:
        token, meaning = own(case)
        before, behind = rng.choice([(' or "', '" = "t"'), (" or 1 + ", "")])
        stored += encode(before) + token + encode(behind)
        parts += [before, meaning, behind]
    return Value(stored, ("formula", parts))


def attributes(case, kind, scope):
    new = kind.startswith("NEW")
    known = scope.attributes
    names = [case.text("fresh", kind) if new or not known else case.random.choice(known)]
    if "LIST" in kind and scope.parameters and case.random.random() < 0.1:
        name, first = case.random.choice(scope.parameters)[0], known[0] if known else "a"
        if is_encoded(kind):
            return Value(f"{encode(first)},$({name})", ("list", [first, [("macro", name)]]))
        return Value(f"{pack([first])},$({name})", ("packed", [[f"{pack([first])},", ("macro", name)]]))
    if "LIST" in kind:
        names = list(dict.fromkeys(names + case.random.sample(known, min(len(known), case.random.randrange(3)))))
        if is_encoded(kind):
            packed = pack([encode(name) for name in names])
            return Value(packed, ("list", names))
        return Value(pack(names), None if any(m in n for m in MEANS for n in names) else ("list", names))
    name = names[0]
    if is_encoded(kind):
        return Value(encode(name), [name])
    return Value(name, None if any(mark in name for mark in MEANS) else [name])


def members(parameter):
    """The separator, and the columns of a table or the members of a multi-parameter."""
    separator, *lines = unpack(parameter.config)
    found = []
    for line in map(decode, lines):
        words = line.split(" ")[1:]
        member = Parameter("")
        while words[0] in ("OPTIONAL", "OMITTABLE"):
            member.flags.append(words.pop(0))
        member.type, member.name = words[0], words[1]
        if member.type.startswith(WITH_CONFIG):
            member.config = "" if words[2] == '""' else words[2]
        found.append(member)
    return decode(separator), found


def unset(parameter):
    return Value("<Unused>", "", not {"OPTIONAL", "OMITTABLE"} & set(parameter.flags))


def table(case, parameter, scope):
    """Now and then one that breaks off in a row, or a condition between two tables."""
    separator, columns = members(parameter)
    rows, odd = case.random.randint(1, 2), case.random.random()
    cells = [make(case, column, scope) or Value("", "") for column in columns * rows]
    broken, expected = any(cell.broken for cell in cells), [cell.expected for cell in cells]
    for at in range(0, len(cells), len(columns)):
        if parameter.name == "SERIES" and expected[at] == "":  # without a label it has that of its values
            expected[at] = expected[at + len(columns) - 1]
    cut = case.random.randint(1, len(columns) - 1) if odd < 0.05 else 0
    stored = pack([cell.stored for cell in cells[:len(cells) - cut]], separator)
    if odd > 0.97 and scope.referable:
        whole = [pack(["word"] * (len(columns) + more), separator) for more in (0, case.random.randrange(2))]
        return Value(conditional(case, parameter.type, scope, [(each, each) for each in whole]).stored, None,
                     any(len(unpack(each, separator)) > len(columns) for each in whole))
    return Value(stored, None if None in expected or cut else ("table", separator, [c.type for c in columns], expected),
                 broken or cut > 0)


def multi(case, parameter, scope):
    """Now and then one that lacks a part."""
    separator, parts = members(parameter)
    values = [make(case, part, scope) for part in parts]
    listed = [each for part, value in zip(parts, values) for each in (part.name, value.stored)]
    cut = case.random.randint(1, 2) if case.random.random() < 0.05 else 0
    made = Value(pack(listed[:len(listed) - cut], separator), None,
                 any(value.broken for value in values) or (cut > 0 and "OPTIONAL" not in parts[-1].flags))
    made.members = dict(zip((part.name for part in parts), zip(parts, values)))
    return made
