"""Words, the word encoding and packed lists, as section 3 of the reference says."""
import re
import unicodedata
from collections import namedtuple

BLANKS = " \t"
SELF = re.compile(r"[A-Za-z0-9\-_.:+*=!?~^|#]")
Word = namedtuple("Word", "start end raw closed")


class Fault(Exception):
    """What an engine cannot read; its text is the fault."""


def stands_for_itself(char):
    return bool(SELF.match(char)) or (ord(char) > 0xA0 and not char.isspace())


def encoded_char(char):
    if stands_for_itself(char):
        return char
    name = unicodedata.name(char, "").lower().replace(" ", "").replace("-", "")
    return "<" + (name or "u%04x" % ord(char)) + ">"


NAMED = {encoded_char(chr(c))[1:-1]: chr(c) for c in range(0x3100) if not stands_for_itself(chr(c))}


def encode(text):
    return "".join(map(encoded_char, text))


def decode(word):
    def text(found):
        number = re.fullmatch("u([0-9a-f]{4,5})", found[1])
        return chr(int(number[1], 16)) if number else NAMED.get(found[1], found[0])

    return re.sub(r"<([a-z0-9]+)>", text, word)


def call_end(text, start):
    """The end of the call that begins at `start` with @NAME(, or -1: braces nest and hide, quotes hide."""
    depth, braces, at = 0, 0, text.index("(", start)
    while at < len(text):
        char = text[at]
        if char == '"' and not braces:
            at = quote_end(text, at) - 1
            if at < 0:
                return -1
        elif char in "{}":
            braces = max(0, braces + (1 if char == "{" else -1))
        elif char in "()" and not braces:
            depth += 1 if char == "(" else -1
            if depth == 0:
                return at + 1
        at += 1
    return -1


def quote_end(text, start):
    """Behind the quote that closes the one at `start`, or 0."""
    at = start + 1
    while at < len(text):
        if text[at] == '"':
            return at + 1
        run = len(re.match(r"\\*", text[at:])[0])
        at += run + (1 if run % 2 and text[at + run:at + run + 1] == '"' else 0) if run else 1
    return 0


KEYED = re.compile(r'(?:TransformFact:[^:\s"]*:|[A-Z_]+:)(?=")')


def split(text, keyed=False):
    """The words of a statement with their places; `closed` is false where a quote or a call has no end.

    In statements of several processes, a value in quotes belongs to the key before it (`keyed`)."""
    found, at = [], 0
    while True:
        while at < len(text) and text[at] in BLANKS:
            at += 1
        if at == len(text):
            return found
        key = KEYED.match(text, at) if keyed else None
        if key or text[at] == '"':
            end = quote_end(text, key.end() if key else at) or -1
            while not key and end > 0 and text[end:end + 2] == ',"':
                end = quote_end(text, end + 1) or -1
        elif re.match(r"@\w+\(", text[at:]):
            end = call_end(text, at)
        else:
            end = at + len(re.match(r"[^ \t]*", text[at:])[0])
        stop = end if end > 0 else len(text)
        found.append(Word(at, stop, text[at:stop], end > 0))
        at = stop


def unquote(raw):
    if len(raw) < 2 or raw[0] != '"' or raw[-1] != '"':
        return raw
    if quote_end(raw, 0) < len(raw):
        return raw  # a list of such
    inner = raw[1:-1]
    tail = len(inner) - len(inner.rstrip("\\"))
    return inner[:len(inner) - tail].replace('\\"', '"') + "\\" * (tail // 2)


def unpack(text, separator=","):
    """The elements of a packed list; an empty text has none."""
    elements, at = [], 0
    if text == "":
        return elements
    while True:
        quoted = re.compile(r'"((?:[^"]|"")*)"(?=%s|$)' % re.escape(separator), re.S).match(text, at)
        end = quoted.end() if quoted else text.find(separator, at)
        end = len(text) if end < 0 else end
        elements.append(quoted[1].replace('""', '"') if quoted else text[at:end])
        if end >= len(text):
            return elements
        at = end + 1


def pack(elements, separator=","):
    """The list as a person's tools store it."""
    def element(text):
        bare = text and separator not in text and not re.search(r'["\r\n]', text) and text.strip() == text
        return text if bare else '"' + text.replace('"', '""') + '"'
    return separator.join(map(element, elements))
