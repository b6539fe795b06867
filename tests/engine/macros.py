"""Macros and the references to them, as section 2 of the reference says."""
from words import Fault

DEEPEST = 64
ALWAYS_SET = {"ORX_HOME": "/home/orx", "WORKSPACE_NAME": "sample", "ORX_MF_NAME": "sample.mf",
              "ORX_BUILD_NUM": "18286"}


class Macros(dict):
    def __init__(self):
        super().__init__(ALWAYS_SET)
        self.unset = []  # what statements referred to
        self.prompted = set()  # what prompt lines name: whoever runs the file gives these a value
        self.early = []  # what values referred to, which are looked at again where they are used

    def expand(self, text, depth=0):
        if depth > DEEPEST:
            raise Fault("more than 64 expansions inside one another")
        result, at = "", 0
        while True:
            start = text.find("$(", at)
            if start < 0:
                return result + text[at:]
            result += text[at:start]
            name, end = self._name(text, start + 2, depth)
            if end < 0:
                result, at = result + "$(", start + 2
                continue
            if name in self:
                result += self.expand(self[name], depth + 1)
            else:
                self.unset.append(name)
                result += "$(" + name + ")"
            at = end

    def expand_early(self, text):
        before = len(self.unset)
        result = self.expand(text)
        self.early += self.unset[before:]
        del self.unset[before:]
        return result

    def expand_inner(self, text):
        """Only what stands inside references: for the one setting that names macros."""
        result, at = "", 0
        while True:
            start = text.find("$(", at)
            if start < 0:
                return result + text[at:]
            name, end = self._name(text, start + 2, 0)
            result += text[at:start] + ("$(" if end < 0 else "$(" + name + ")")
            at = start + 2 if end < 0 else end

    def _name(self, text, at, depth):
        """The name of the reference whose name begins at `at`, references in it expanded, and its end."""
        name = ""
        while at < len(text):
            if text.startswith("$(", at):
                inner, at = self._name(text, at + 2, depth)
                if at < 0:
                    return "", -1
                if inner not in self:
                    self.unset.append(inner)
                name += self.expand(self[inner], depth + 1) if inner in self else "$(" + inner + ")"
            elif text[at] == ")":
                return (name, at + 1) if name else ("", -1)
            elif text[at] in " \t\r\n$(":
                return "", -1
            else:
                name += text[at]
                at += 1
        return "", -1
