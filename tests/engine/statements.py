"""From the text of a mapping file to its statements, as section 1 of the reference says."""
import re
from collections import namedtuple

Statement = namedtuple("Statement", "text line")
Block = namedtuple("Block", "header lines")


def parts(text):
    """The statements, and in `blocks` the definitions of custom transformers that the text carries."""
    lines = re.split(r"\r\n|\n|\r", text)
    statements, blocks, at = [], [], 0
    script = False
    while at < len(lines):
        line, first = lines[at], at + 1
        if line.startswith("# TRANSFORMER_BEGIN ") and not script:
            end = next((i for i in range(at, len(lines)) if lines[i].startswith("# TRANSFORMER_END")), len(lines))
            inside = [re.sub("^# ?", "", each) for each in lines[at + 1:end]]
            blocks.append(Block(line[len("# TRANSFORMER_BEGIN "):], inside))
            at = end + 1
            continue
        while line.endswith("\\") and at + 1 < len(lines):
            at += 1
            line = line[:-1] + lines[at]
        at += 1
        bare = line.strip(" \t")
        if script or bare and not bare.startswith("#"):
            if bare:
                statements.append(Statement(line, first))
            script = bare in ("INCLUDE PYTHON", "INCLUDE TCL") or script and bare != "END_INCLUDE"
    return statements, blocks


def definition(blocks, name, version):
    """The text of a definition among the blocks, and the blocks inside it; None when it is not there."""
    for block in blocks:
        fields = [field.strip() for field in block.header.split(",")]
        if fields[0] == name and (int(fields[1] or 0) or 1 if fields[1:] else 1) == int(version):
            return "\n".join(block.lines)
    return None
