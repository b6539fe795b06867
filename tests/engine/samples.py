"""Reads the reference output of the samples: samples.py HOME SAMPLES."""
import glob
import os
import re
import sys
import xml.etree.ElementTree as ElementTree

import catalogue
from engine import Engine, Run
from functions import Feature


def document(path):
    with open(path, encoding="utf-8") as file:
        lines = file.read().split("\n")
    end = next((i for i, line in enumerate(lines) if re.match(r" *#! *START_HEADER", line)), len(lines))
    return ElementTree.fromstring("\n".join(re.sub("^ *#!  *", "", line) for line in lines[:end]
                                            if re.match("^ *#!  *", line)).encode())


def main(home, samples):
    engine, failed = Engine(catalogue.read([home + "/transformers"])[1], [samples]), 0
    for path in sorted(glob.glob(samples + "/*.orw")):
        types = list(document(path).iter("FEATURE_TYPE"))
        readers = {(t.get("KEYWORD"), t.get("FEATURE_TYPE_NAME")) for t in types if t.get("IS_SOURCE") == "true"}
        with open(path[:-3] + "mf", encoding="utf-8") as file:
            run = Run(engine, file.read(), readers)
        faults = run.complaints(Feature()) + run.unfed()
        faults += [f"nothing arrives at the writer's {t.get('FEATURE_TYPE_NAME')}" for t in types
                   if t.get("IS_SOURCE") != "true" and t.get("ENABLED", "true") == "true" and
                   not run.arriving(t.get("KEYWORD"), t.get("FEATURE_TYPE_NAME"))]
        print(f"{os.path.basename(path)}: {len(run.factories)} factories, {len(faults)} faults")
        print("".join(f"  {fault}\n" for fault in faults), end="")
        failed += bool(faults)
    engine.tcl.close()
    return int(failed > 0)


sys.exit(main(*sys.argv[1:]))
