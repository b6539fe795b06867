"""Scripts of mapping files, really run (section 7 of the reference): Tcl in safe interpreters of one child."""
import base64
import os
import re
import subprocess
import tempfile

from words import Fault

CHILD = r"""
proc fresh {} {
  foreach i {include each} {
    catch {interp delete $i}
    interp create -safe $i
    foreach word {puts puts_real exit} {interp alias $i $word {} $word-from}
  }
}
proc puts-from {args} {lappend ::lines [lindex $args end]}
proc puts_real-from {args} {lappend ::log [lindex $args end]}
proc exit-from {args} {set ::ended 1; return -code error "the script ended the translation"}
proc code {text} {binary encode base64 [encoding convertto utf-8 $text]}
fconfigure stdout -buffering full -translation lf
while {[gets stdin request] >= 0} {
  lassign $request which script macros
  if {$which eq "fresh"} {fresh; continue}
  set lines {}; set log {}; set ended 0
  if {$macros ne ""} {
    $which eval [list array set ORX_MacroValues [encoding convertfrom utf-8 [binary decode base64 $macros]]]
  }
  $which limit command -value {}
  $which limit command -value [expr {[$which eval {info cmdcount}] + 20000}]
  set code [catch {$which eval [encoding convertfrom utf-8 [binary decode base64 $script]]} answer]
  puts stdout [list $code [code $answer] [lmap l $lines {code $l}] $ended]
  flush stdout
}
"""


def to_tcl(text):
    return base64.b64encode("".join(map(_halves, text)).encode("utf-8", "surrogatepass")).decode()


def _halves(char):
    """Tcl 8.6 knows no characters beyond the first 65536: such a one travels as its two halves."""
    if ord(char) < 0x10000:
        return char
    rest = ord(char) - 0x10000
    return chr(0xD800 + (rest >> 10)) + chr(0xDC00 + (rest & 0x3FF))


def from_tcl(word):
    text = base64.b64decode(word).decode("utf-8", "surrogatepass")
    return text.encode("utf-16-le", "surrogatepass").decode("utf-16-le", "replace")


class Tcl:
    """The two interpreters: `include` of INCLUDE, `each` of Tcl2 and @Tcl2."""

    def __init__(self):
        with tempfile.NamedTemporaryFile("w", suffix=".tcl", delete=False) as file:
            file.write(CHILD)
        self.script = file.name
        self.child = subprocess.Popen(["tclsh", self.script], stdin=subprocess.PIPE, stdout=subprocess.PIPE, text=True)

    def close(self):
        self.child.stdin.close()
        self.child.wait()
        self.child.stdout.close()
        os.unlink(self.script)

    def fresh(self):
        self.child.stdin.write("fresh\n")

    def run(self, which, script, macros=None):
        """The script's result and the lines that it wrote."""
        table = to_tcl("".join(f" {tcl_word(n)} {tcl_word(v)}" for n, v in (macros or {}).items()))
        self.child.stdin.write(f"{which} {{{to_tcl(script)}}} {{{table}}}\n")
        self.child.stdin.flush()
        code, answer, lines, ended = self._answer()
        if ended or code not in ("0", "2"):
            raise Fault("Tcl: " + answer + " in " + script[:200])
        return answer, lines

    def _answer(self):
        line = self.child.stdout.readline().rstrip("\n")
        code, answer, lines, ended = re.fullmatch(r"(\d+) (\{\}|\S+) (\{.*\}|\S+) (\d)", line).groups()
        lines = [] if lines == "{}" else re.findall(r"\{\}|[^\s{}]+", lines)
        return code, from_tcl(answer.strip("{}")), [from_tcl(each.strip("{}")) for each in lines], ended == "1"


def tcl_word(text):
    return re.sub(r"([^A-Za-z0-9_])", r"\\\1", text).replace("\\\n", "\\n") or "{}"


def run_python(lines, macros):
    """The macros that the block sets: its lines are the body of a function."""
    body = "def block(ORX_MacroValues):\n" + "".join("  " + line + "\n" for line in [*lines, "pass"])
    space = {}
    try:
        exec(compile(body, "INCLUDE PYTHON", "exec"), space)
        return {str(name): str(value) for name, value in (space["block"](dict(macros)) or {}).items()}
    except Exception as error:
        raise Fault(f"Python: {error}") from error
