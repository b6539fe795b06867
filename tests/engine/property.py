"""What is valid is written, what is written passes lint, and an engine reads back what was set."""
import argparse
import glob
import itertools
import json
import os
import re
import subprocess
import sys
import tempfile
import time
from collections import Counter

import catalogue
import values
import workspaces
from engine import Engine, Run
from functions import attributes_in, formula, shown
from words import Fault, decode, pack, unpack

# Families that are known and not mended yet: the check, and a pattern of what it says.
EXCLUDED = []


class Command:
    """The built command, asked about many workspaces at once."""

    def __init__(self, orxt, home, resources, jobs):
        self.orxt, self.jobs = orxt, str(jobs)
        self.resources = [part for folder in resources for part in ("--resources", folder)]
        self.env = dict(os.environ, ORX_HOME=home, XDG_DATA_HOME="/nowhere", LC_ALL="C.UTF-8")

    def run(self, *arguments):
        done = subprocess.run([self.orxt, *arguments, *self.resources, "--lang", "en"], env=self.env, text=True,
                              capture_output=True, errors="replace")
        if done.returncode not in (0, 1):
            raise SystemExit(f"{arguments[0]} ended with {done.returncode}: {done.stderr[-2000:]}")
        return done

    def judge(self, paths, twins, folder):
        """For each path: the errors of validation, the file that was written or None, the errors of lint."""
        validated = self.run("validate", "--json", *paths)
        reports = json.loads(validated.stdout)
        errors = {r["file"]: [f"{f['rule']}: {f['text']}" for f in r["findings"] if f["severity"] == "error"] +
                  ([r["unreadable"]] if r["unreadable"] else []) for r in reports}
        if (validated.returncode == 0) != (not any(errors.values())):
            raise SystemExit("the exit status of validate is not that of its findings")
        self.run("generate", "-d", folder, "-j", self.jobs, *paths)
        self.run("generate", "-d", folder + "-twins", "-j", self.jobs, *twins)
        linted = {}
        for finding in json.loads(self.run("lint", "--json", folder).stdout or "[]"):
            if finding["severity"] == "error":
                linted.setdefault(finding["file"], []).append(f"{finding['rule']}: {finding['text']}")

        def output(path, folder):
            name = os.path.join(folder, os.path.basename(path)[:-3] + "mf")
            return name if os.path.exists(name) else None
        made = [output(path, folder) for path in paths]
        return [(errors[path], one, linted.get(one, []), output(twin, folder + "-twins"))
                for path, one, twin in zip(paths, made, twins)]


class Property:
    def __init__(self, command, definitions, kinds, folder, resources):
        self.command, self.definitions, self.folder, self.resources = command, definitions, folder, resources
        self.engine = Engine(kinds, [resources])
        self.tried, self.written, self.refused, self.linked = 0, 0, Counter(), 0

    def make(self, seed, skipped=(), dropped=(), tame=False):
        return workspaces.Case(self.definitions, seed, tame, skipped, dropped)

    def store(self, case, path):
        """The workspace as a file, and its linked custom transformer in the folder of definitions."""
        def write(text):
            with open(path, "w", encoding="utf-8", newline="") as file:
                file.write(text)
        write(case.document())
        if case.linked:
            file = os.path.join(self.resources, os.path.basename(path)[:-3] + "ort")
            done = self.command.run("extract", path, case.linked.name, "-o", file)
            self.linked += done.returncode == 0
            write(case.document(embeds=done.returncode != 0))

    def check(self, keys):
        """The problems of each case; a key is a seed and the draws that are left out."""
        with tempfile.TemporaryDirectory(dir=self.folder) as folder:
            made = [(self.make(*key), self.make(*key, tame=True)) for key in keys]
            paths = [[os.path.join(folder, f"{at:05}{kind}.orw") for at in range(len(keys))] for kind in "ht"]
            for case, path in ((pair[kind], paths[kind][at]) for at, pair in enumerate(made) for kind in (0, 1)):
                self.store(case, path)
            self.engine.files = None
            self.tried += len(keys)
            judged = self.command.judge(*paths, os.path.join(folder, "out"))
            found = [self.problems(*pair, *each) for pair, each in zip(made, judged)]
            for file in glob.glob(self.resources + "/0*.ort"):
                os.unlink(file)
            return [[each for each in problems if not excluded(each)] for problems in found]

    def problems(self, case, tame, errors, output, linted, twin):
        self.written += output is not None
        self.refused.update(error.split(":")[0] for error in errors[:1])
        if bool(errors) != (output is None):
            return [("judgement", "refused but written" if errors else "passed but not written", errors[:1])]
        if not output:
            return []
        if case.broken():
            return [("judgement", "written though broken", case.broken()[0])]
        run = self.read(case, output)
        unfit = [value.stored for _, node, _, _ in case.instances() for value in node.values.values() if value.unfit]
        if unfit:
            return [("judgement", "unfit but written", unfit)]
        found = [("lint", each, "") for each in linted]
        found += [("engine", each, "") for each in run.complaints(case.feature)]
        found += [*self.flows(case, run), *self.values(case, run)]
        if twin and "<Unused>" not in (text for _, _, text in case.used):  # which is no value at all
            found += [("shape", *each) for each in difference(run.shapes, self.read(tame, twin).shapes)]
        return found

    def read(self, case, output):
        with open(output, encoding="utf-8", newline="") as file:
            return Run(self.engine, file.read(), case.readers())

    def flows(self, case, run):
        made = {}
        for each in run.factories:
            made.setdefault(each.name, []).append(each)
        for name, node, scope, around in case.instances():
            found = [each for each in made.get(name, []) if each.kind == node.definition.kind]
            if any(mark in name for mark in ("$(", "$[")):
                continue
            if len(found) != 1:
                yield ("name", f"{len(found)} factories {name!r}", "")
                continue
            node.found = getattr(node, "found", {})
            node.found[name] = found[0]
            for tag in node.definition.inputs:
                reached = found[0].reached.get(node.definition.aliases[tag], set())
                expected = case.sources(scope, around, node, tag)
                if reached != expected:
                    yield ("flow", f"{name}.{tag}: {sorted(map(str, reached))}", f"not {sorted(map(str, expected))}")
        for node, keyword in case.main.writers:
            reached, expected = run.arriving(keyword, node.name), case.sources(case.main, [], node, "")
            if reached != expected:
                yield ("flow", f"writer {node.name}: {sorted(map(str, reached))}",
                       f"not {sorted(map(str, expected))}")

    def values(self, case, run):
        for name, node, scope, around in case.instances():
            made = getattr(node, "found", {}).get(name)
            for parameter in node.definition.parameters if made else []:
                value = node.values.get(parameter.name)
                if value is None:
                    continue
                parts = getattr(value, "members", {parameter.name: (parameter, value)})
                for member, (kind, part) in parts.items():
                    expected = resolve(part.expected, scope, around, node)
                    if isinstance(expected, str) and not values.is_encoded(kind.type):
                        expected = expected.strip(" \t")
                    for key in node.definition.keys_of(member) if expected is not None else []:
                        yield from self.value(run, case, made, key, kind.type, expected, part)
            if made:
                yield from self.listed(run, name, node)
            level = made and node.values.get("ORX_PROCESS_COUNT")
            if level and level.expected:
                expected = resolve(level.expected, scope, around)
                came = [each.values("PARALLELISM") for each in run.factories
                        if each.name == name and each.kind.startswith("TransformFact:")]
                if came not in ([], [[expected]]):
                    yield ("value", f"{name}: the level {came}", f"not {expected!r} of {level.stored!r}")

    def listed(self, run, name, node):
        """What workers are told of the parameters: the values as they are stored, references included."""
        for each in run.factories:
            listed = unpack("".join(each.values("TRANSFORMER_PARAMS")))
            if each.name != name or each.values("RUN") != ["STATEMENTS"]:
                continue
            given = dict(zip(map(decode, listed[::2]), map(decode, listed[1::2])))
            stored = {parameter.name: node.values[parameter.name].stored for parameter in node.definition.parameters
                      if parameter.name in node.values and not values.entries(parameter)}
            for key, value in stored.items():
                if len(listed) % 2 or given.get(key) != value and ("$" not in value or key not in given):
                    yield ("value", f"{name}: {key} listed as {listed[:40]}", f"not {value!r}")

    def value(self, run, case, made, key, kind, expected, part):
        stood = made.values(key)
        try:
            came = back(run, case, kind, expected, stood[0]) if stood else ""
        except Fault as fault:
            came = fault
        if len(stood) > 1 or came != expected and not (expected in ("", [], ("list", [])) and came in (
                "", "<Unused>", "<UNUSED>")):
            yield ("value", f"{made.name}: {key} ({kind}) holds {stood}",
                   f"{came!r}, not {expected!r} of {part.stored!r}")


def excluded(problem):
    text = " ".join(map(str, problem[1:]))
    return any(check == problem[0] and re.search(pattern, text) for check, pattern in EXCLUDED)


def resolve(expected, scope, around, node=None):
    """The text that is to come back, macros of documents replaced; None when nothing is to be compared."""
    if isinstance(expected, tuple) and expected[0] == "table":
        cells = [resolve(each, scope, around, node) for each in expected[3]]
        return None if None in cells else (*expected[:3], cells)
    if isinstance(expected, tuple) and expected[0] in ("list", "packed"):
        items = [resolve(each, scope, around, node) for each in expected[1]]
        return None if None in items else (
            "list", items if expected[0] == "list" else unpack(items[0].strip(" \t")))
    if isinstance(expected, tuple) and expected[0] == "formula":
        text = resolve(expected[1], scope, around, node)
        return None if text is None else ("formula", text)
    if not isinstance(expected, list):
        return expected
    pieces = []
    for piece in expected:
        if isinstance(piece, tuple) and piece[0] == "own":
            value = node.values.get(piece[1]) if node else None
            comparable = value is not None and isinstance(value.expected, (str, list))
            piece = resolve(value.expected, scope, around, node) if comparable else None
        elif isinstance(piece, tuple):
            value = around[-1][1].values[piece[1]] if around else \
                next(value for name, _, _, value in scope.parameters if name == piece[1])
            piece = resolve(value.expected, *((around[-1][0], around[:-1]) if around else (scope, around)))
        pieces.append(piece)
    return None if None in pieces else "".join(pieces)


def back(run, case, kind, expected, stood):
    """What an engine takes from a setting."""
    encoded = values.is_encoded(kind) or kind.startswith("EXPRESSION")
    if isinstance(expected, tuple) and expected[0] == "list":
        return "list", [decode(each) if encoded else each for each in unpack(stood)]
    if isinstance(expected, tuple) and expected[0] == "formula":
        given = formula(attributes_in(expected[1], case.feature), True)
        came = run.value(stood, case.feature)
        return expected if expected[1] in (decode(stood), decode(came)) or came == shown(given) else came
    if isinstance(expected, tuple):
        _, separator, kinds, cells = expected
        came = [back(run, case, kind, cell, each) for kind, cell, each in
                zip(itertools.cycle(kinds), cells, unpack(stood, separator))]
        # A class of its own empties the cells that mean nothing in their row.
        return "table", separator, kinds, [cell if each in ("", ("list", [])) else each
                                           for each, cell in itertools.zip_longest(came, cells, fillvalue="missing")]
    came = run.value(stood, case.feature)
    if "LISTBOX" in kind:
        return pack(unpack(came, " "), " ")
    return decode(came) if encoded else came.strip(" \t")


def difference(shapes, twins):
    """The first statements that only one of two files has."""
    more, less = Counter(shapes) - Counter(twins), Counter(twins) - Counter(shapes)
    for kind in ("READER_FEATURE_TYPE", "WRITER_FEATURE_TYPE"):  # only where names meet
        del more[kind], less[kind]
    if more or less:
        yield (f"more {[str(each)[:300] for each in more][:2]}", f"less {[str(each)[:300] for each in less][:2]}")


def shrink(prop, key, problems):
    """A failing case with as few hostile texts and nodes as it takes."""
    def failing(keys):
        return next(((key, found) for key, found in zip(keys, prop.check(keys) if keys else []) if found and
                     found[0][0] == problems[0][0]), None)
    seed, draws = key[0], [number for number, _, _ in prop.make(*key).used]
    found = failing([(seed, tuple(draws), ())] + [(seed, tuple(each for each in draws if each != one), ())
                                                  for one in draws]) or (key, problems)
    while True:
        seed, skipped, dropped = found[0]
        rest = [at for at in range(len(prop.make(*found[0]).nodes)) if at not in dropped]
        smaller = failing([(seed, skipped, (*dropped, at)) for at in rest])
        if not smaller:
            return found
        found = smaller


def report(prop, key, problems, keep):
    case = prop.make(*key)
    print(f"case {key[0]}, without the texts {key[1]} and the nodes {key[2]}: {case.used}")
    for problem in problems[:3]:
        print("   ", *(str(each)[:400] for each in problem))
    if keep:
        os.makedirs(keep, exist_ok=True)
        with open(os.path.join(keep, f"{key[0]}.orw"), "w", encoding="utf-8", newline="") as file:
            file.write(case.document())
    return len(case.document()), key[0]


def main():
    options = argparse.ArgumentParser(description=__doc__)
    options.add_argument("orxt")
    options.add_argument("source", help="the project's folder")
    options.add_argument("--cases", type=int, default=2000)
    options.add_argument("--seed", type=int, default=1)
    options.add_argument("--jobs", type=int, default=2)
    options.add_argument("--seconds", type=int, default=0, help="go on with further seeds for so long")
    options.add_argument("--keep", help="folder for what fails, made as small as it goes")
    asked = options.parse_args()
    home, until = asked.source + "/resources", time.monotonic() + asked.seconds
    with tempfile.TemporaryDirectory() as folder:
        resources = os.path.join(folder, "definitions")
        os.mkdir(resources)
        catalogue.write_typed(asked.source + "/docs/definition-files.md", catalogue.read([home + "/transformers"])[0],
                              values.PASSIVE, resources)
        definitions, kinds = catalogue.read([home + "/transformers", resources])
        prop = Property(Command(asked.orxt, home, [resources], asked.jobs), definitions, kinds, folder, resources)
        smallest, seed, failed = [], asked.seed, 0
        while seed < asked.seed + asked.cases or time.monotonic() < until:
            left = asked.seed + asked.cases - seed
            keys = [(each, (), ()) for each in range(seed, seed + min(200, left if left > 0 else 200))]
            seed += len(keys)
            for key, problems in zip(keys, prop.check(keys)):
                if problems:
                    failed += 1
                    key, problems = shrink(prop, key, problems) if asked.keep else (key, problems)
                    smallest.append(report(prop, key, problems, asked.keep))
        print(f"seeds {asked.seed} to {seed - 1}: {prop.tried} workspaces, {prop.written} written, {prop.linked} with "
              f"a linked custom transformer; {failed} failed; refused by", dict(prop.refused))
        if smallest:
            print("the smallest that fails: seed", min(smallest)[1])
        prop.engine.tcl.close()
    # A test that refuses nearly everything would find nothing; two of five are written, more or less by the seed.
    return int(failed > 0 or prop.written * 5 < prop.tried)


if __name__ == "__main__":
    sys.exit(main())
