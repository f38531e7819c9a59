#!/usr/bin/env python3
"""zornet beside a plain program (plain.cpp) on whole models: whole.py FOLDER [OTHER], with the programs of a build.

Prints a table: seconds of processor time, the least of some runs that take turns, peak memory, and what zornet allocates
for a constraint. Both have to write the same. OTHER is a zornet of another build, to take the first one's place.
"""
import hashlib
import os
import pathlib
import subprocess
import sys
import tempfile

RUNS = 7
# Work, size, at most: time and memory as ratios to the plain program, allocations of a constraint.
TARGETS = [
    ('order', 10000, 2, None, None), ('order16', 10000, 2, None, None), ('sets', 10000, 2, None, None),
    ('mix', 10000, 2, None, None), ('chain', 100000, 2, 1.5, 8), ('order', 100000, None, 1.5, 8),
    ('sets', 100000, 2, 1.5, 20), ('mix', 100000, 2, None, None),
]


class Run:
    """A program on a file: what it wrote, its seconds and its peak in bytes. A child begins with the peak of this process,
    which therefore never holds a model or an output."""

    def __init__(self, command, env=None):
        with tempfile.TemporaryFile() as out, tempfile.TemporaryFile() as err:
            child = subprocess.Popen(command, stdout=out, stderr=err, env=env)
            _, status, usage = os.wait4(child.pid, 0)
            child.returncode = os.waitstatus_to_exitcode(status)
            if child.returncode != 0:
                sys.exit(f'{command} ends with {child.returncode}')
            out.seek(0)
            err.seek(0)
            self.out, self.err = hashlib.sha256(), err.read()
            while part := out.read(1 << 16):
                self.out.update(part)
        self.seconds, self.peak = usage.ru_utime + usage.ru_stime, usage.ru_maxrss * 1024


def row(folder, zornet, model, work, size, most_time, most_memory, most_allocations):
    with model.open('wb') as out:
        subprocess.run([folder / 'zorproblem', work, str(size)], check=True, stdout=out)
    ours, plain = [zornet, '-q', model], [folder / 'zorplain', model]
    runs = [(Run(ours), Run(plain)) for _ in range(RUNS)]
    if any(a.out.digest() != b.out.digest() for a, b in runs):
        sys.exit(f'{work} of {size}: zornet and the plain program differ')
    mine, theirs = (min(run[i].seconds for run in runs) for i in (0, 1))
    memory = [min(run[i].peak for run in runs) for i in (0, 1)]
    counted = Run(ours, dict(os.environ, LD_PRELOAD=str(folder / 'libzorcount.so'))).err
    allocations = int(counted.split()[-1]) / size
    for what, value, most in (('time', mine / theirs, most_time), ('memory', memory[0] / memory[1], most_memory),
                              ('allocations', allocations, most_allocations)):
        if most is None:
            continue
        shown = {'time': f'{mine:.3f} s of {theirs:.3f}', 'memory': f'{memory[0] / 1e6:.0f} MB of {memory[1] / 1e6:.0f}',
                 'allocations': 'of a constraint'}[what]
        print(f'| {work} | {size:,} | {what} | {shown} | {value:.1f} | {most} | {"yes" if value <= most else "**no**"} |',
              flush=True)


def main():
    folder = pathlib.Path(sys.argv[1]).resolve()
    zornet = pathlib.Path(sys.argv[2]).resolve() if len(sys.argv) > 2 else folder / 'zornet'
    print('| work | size | what | zornet of the plain program | measured | at most | met |\n' + '|---' * 7 + '|')
    with tempfile.TemporaryDirectory() as work:
        for target in TARGETS:
            row(folder, zornet, pathlib.Path(work) / 'model.szn', *target)


main()
