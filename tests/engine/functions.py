"""Functions and formulas, evaluated for one feature (sections 5 and 6 of the reference)."""
import re
import zlib

from words import Fault, call_end, decode, encode, unquote

TOKEN = re.compile(r'\s*(?:((?:\d+(?:\.\d+)?|\.\d+)(?:[eE][-+]?\d+)?)(?!\w)|"((?:[^"]|"")*)"|([A-Za-z_]\w*)|(!=|<=|>=|[=<>+\-*/%(),])|(\S))')
TYPES = ("STRING", "STRING_ENCODED", "INT", "FLOAT")
FUNCTIONS = {"abs": abs, "max": max, "min": min, "round": round}


class Feature(dict):
    """The sample feature: each attribute that it is asked for is a number of its own."""

    def get(self, name, default=None):
        return str(1000 + zlib.crc32(name.encode("utf-8", "surrogatepass")) % 9000)


def evaluate(text, feature, tcl):
    """What a whole value gives for the feature: that of its call, or the text itself."""
    call = re.match(r"@(\w+)\(", text)
    if not call or call_end(text, 0) != len(text):
        return text
    inside = text[call.end():-1]
    if call[1] == "Value":
        return feature.get(decode(unquote(inside)), "")
    if call[1] == "Tcl2":
        return tcl.run("each", inside)[0]
    if call[1] == "EvaluateExpression":
        return expression(inside, feature)
    return text


def expression(inside, feature):
    divides = inside.startswith("FDIV,")
    fields = (inside[5:] if divides else inside).split(",", 2)
    if len(fields) < 3 or fields[0] not in TYPES:
        raise Fault("no @EvaluateExpression: " + inside)
    kind, _, body = fields
    choices = [body]
    choose = body.startswith("@Choose(") and body.endswith(")")
    if choose:
        choices = body[len("@Choose("):-1].split(",")
    parts = [operands(each, feature) for each in choices]
    result = parts[0]
    if choose:
        pairs = len(parts) // 2
        taken = next((2 * i + 1 for i in range(pairs) if true(formula(parts[2 * i], divides))), 2 * pairs)
        result = parts[taken] if taken < len(parts) else []
    if kind in ("INT", "FLOAT"):
        value = number(formula(result, divides)) if result or not choose else ""
        return shown(round(value) if kind == "INT" and value != "" else value)
    joined = "".join(part if isinstance(part, str) else part[0] for part in result)
    return encode(joined) if kind == "STRING_ENCODED" else joined


def operands(text, feature):
    """Texts, and the values of attributes as tuples."""
    result, at = [], 0
    for found in re.finditer(r"@Value\(([^()]*)\)", text):
        result += [text[at:found.start()], (feature.get(decode(found[1]), ""),)]
        at = found.end()
    result.append(text[at:])
    for part in result:
        if isinstance(part, str) and re.search(r"[(),{}\"]", part):
            raise Fault("bare characters in an expression: " + text)
    return [decode(part) if isinstance(part, str) else part for part in result if part != ""]


def attributes_in(text, feature):
    """The operands of a formula that stands decoded, as factories read it."""
    result, at = [], 0
    while True:
        start = text.find("@Value(", at)
        end = call_end(text, start) if start >= 0 else -1
        if end < 0:
            return [part for part in result + [text[at:]] if part != ""]
        result += [text[at:start], (feature.get(unquote(text[start + 7:end - 1]), ""),)]
        at = end


def true(value):
    return value != 0 if isinstance(value, (int, float)) else value not in ("", "0")


def number(value):
    try:
        return value if isinstance(value, (int, float)) else \
            int(value) if re.fullmatch(r"\s*[-+]?\d+\s*", value) else float(value)
    except ValueError:
        raise Fault(f"no number: {value!r}") from None


def shown(value):
    return repr(int(value)) if isinstance(value, float) and value == int(value) else str(value)


def formula(parts, divides):
    tokens = []
    for part in parts:
        if not isinstance(part, str):
            tokens.append(("value", part[0]))
            continue
        for digits, quoted, name, sign, other in TOKEN.findall(part.strip()):
            if other:
                raise Fault(f"no formula: {parts}")
            tokens.append(("value", number(digits)) if digits else ("name", name.lower()) if name else
                          ("sign", sign) if sign else ("value", quoted.replace('""', '"')))
    value, at = _binary(tokens, 0, 0, divides)
    if at != len(tokens):
        raise Fault(f"no formula: {parts}")
    return value


LEVELS = [("or",), ("and",), ("not",), ("=", "!=", "<", "<=", ">", ">="), ("+", "-"), ("*", "/", "%")]


def _binary(tokens, at, level, divides):
    if level == len(LEVELS):
        return _operand(tokens, at, divides)
    if LEVELS[level] == ("not",):
        if tokens[at:at + 1] == [("name", "not")]:
            value, at = _binary(tokens, at + 1, level, divides)
            return int(not true(value)), at
        return _binary(tokens, at, level + 1, divides)
    left, at = _binary(tokens, at, level + 1, divides)
    while at < len(tokens) and tokens[at][0] in ("sign", "name") and tokens[at][1] in LEVELS[level]:
        sign = tokens[at][1]
        right, at = _binary(tokens, at + 1, level + 1, divides)
        left = _apply(sign, left, right, divides)
    return left, at


def _apply(sign, left, right, divides):
    if sign in ("or", "and"):
        return int(true(left) or true(right) if sign == "or" else true(left) and true(right))
    if sign in LEVELS[3]:
        try:
            left, right = number(left), number(right)
        except Fault:
            left, right = (each if isinstance(each, str) else shown(each) for each in (left, right))
        return int({"=": left == right, "!=": left != right, "<": left < right, "<=": left <= right,
                    ">": left > right, ">=": left >= right}[sign])
    left, right = number(left), number(right)
    if sign in "/%" and right == 0:
        raise Fault("division by zero")
    whole = isinstance(left, int) and isinstance(right, int) and not divides
    return {"+": lambda: left + right, "-": lambda: left - right, "*": lambda: left * right,
            "/": lambda: int(left / right) if whole else left / right, "%": lambda: left % right}[sign]()


def _operand(tokens, at, divides):
    kind, text = tokens[at] if at < len(tokens) else ("", "")
    if kind == "value":
        return text, at + 1
    if kind == "sign" and text in "+-":
        value, at = _operand(tokens, at + 1, divides)
        return (-number(value) if text == "-" else number(value)), at
    if kind == "sign" and text == "(":
        value, at = _binary(tokens, at + 1, 0, divides)
    elif kind == "name" and text in FUNCTIONS and tokens[at + 1:at + 2] == [("sign", "(")]:
        arguments, at = [], at + 1
        while tokens[at:at + 1] in ([("sign", "(")], [("sign", ",")]):
            argument, at = _binary(tokens, at + 1, 0, divides)
            arguments.append(number(argument))
        value = FUNCTIONS[text](*arguments)
    else:
        raise Fault(f"no operand: {text!r}")
    if tokens[at:at + 1] != [("sign", ")")]:
        raise Fault("no closing parenthesis")
    return value, at + 1
