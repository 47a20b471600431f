#!/usr/bin/env python3
"""Writes the reference data of every task: generate.py FOLDER

The expected values are worked out from the formulas, apart from the engine and without its tables. One file per
task, in the form that tests/support/ReferenceCases.h explains.
"""
import pathlib
import sys

import analyzers
import automatic
import detail
import levels
import measurements
import tones

lines = {}
for module in (analyzers, automatic, detail, levels, measurements, tones):
    for task, line in module.cases():
        lines.setdefault(task, []).append(line)
for task, cases in lines.items():
    path = pathlib.Path(sys.argv[1]) / f"{task}.txt"
    path.write_text("\n".join([f"cases {len(cases)}", *cases, ""]))
