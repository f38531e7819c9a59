#!/usr/bin/env python3
"""Whole networks: networks.py ZORNET PLAIN. Prints two tables: zornet beside a plain program that does the same by hand
(bench/plain.cpp), and how the time grows with the network. Processor time is the least of some runs, memory the peak,
allocations are counted by valgrind; all of them of the whole program, from the text of the model to that of the result.
"""
import hashlib
import itertools
import os
import pathlib
import random
import re
import subprocess
import sys
import tempfile

ZORNET, PLAIN = (str(pathlib.Path(program).resolve()) for program in sys.argv[1:3])
RUNS = 5
ALPHABET = 'abcdefghijklmnopqrstuvwxyz'

# At most: the time and the memory as ratios to the plain program's, allocations for a constraint.
WANTED = {('order', 10000): (2, None, None), ('order16', 10000): (2, None, None), ('sets', 10000): (2, None, None),
          ('mix', 10000): (2, None, None), ('chain', 100000): (2, 1.5, 8), ('order', 100000): (None, 1.5, 8),
          ('sets', 100000): (2, 1.5, 20), ('mix', 100000): (2, None, None)}


class Writer:
    def __init__(self):
        self.random, self.lines = random.Random(7), []

    def word(self, length):
        return ''.join(self.random.choices(ALPHABET, k=length))

    def drawn(self, count, length):
        return {self.word(length) for _ in range(count)}

    def declare(self, name, texts=None):
        kind = 'set string' if texts is None else 'string' if texts == '' else texts_of(texts)
        self.lines.append(f'var {kind}: {name};')

    def post(self, kind, *arguments):
        self.lines.append(f'constraint {kind}({", ".join(arguments)});')


def texts_of(texts):
    return '{' + ', '.join(f'"{text}"' for text in texts) + '}'


def chain(writer, size):
    """A text that loses four characters in front and gains four behind, again and again."""
    text = writer.word(16)
    writer.declare('v0', '')
    writer.post('str_concat', f'"{text}"', '""', 'v0')
    for i in range(size // 2):
        tail = writer.word(4)
        writer.declare(f'p{i}', '')
        writer.declare(f'v{i + 1}', '')
        writer.post('str_concat', f'v{i}', f'"{tail}"', f'p{i}')
        writer.post('str_concat', f'"{text[:4]}"', f'v{i + 1}', f'p{i}')
        text = text[4:] + tail


def sets(writer, size):
    """The same with sets, of which half the texts fit."""
    texts = writer.drawn(8, 8)
    writer.declare('v0', sorted(texts))
    for i in range(size // 2):
        tails, heads = writer.drawn(4, 4), {text[:4] for text in texts}
        fitting = sorted({(text + tail)[4:] for text in texts for tail in tails})
        texts = set(writer.random.sample(fitting, 8))
        writer.declare(f'p{i}')
        for name, listed in ((f't{i}', tails), (f'h{i}', heads), (f'v{i + 1}', texts | writer.drawn(8, 8))):
            writer.declare(name, sorted(listed))
        writer.post('str_concat', f'v{i}', f't{i}', f'p{i}')
        writer.post('str_concat', f'h{i}', f'v{i + 1}', f'p{i}')


def order(writer, size, texts=4):
    """Sets, each at most the next."""
    for i in range(size + 1):
        writer.declare(f'v{i}', sorted(writer.drawn(texts - 1, 8) | {f'm{100000 + i}'}))
        if i:
            writer.post('str_le', f'v{i - 1}', f'v{i}')


def order16(writer, size):
    order(writer, size, 16)


def mix(writer, size):
    """Orders, inequalities and concatenations in turn."""
    for i in range(size // 4):
        heads, tails = sorted(writer.drawn(4, 4)), sorted(writer.drawn(4, 4))
        joined = {head + tail for head in heads for tail in tails}
        writer.declare(f'h{i}', heads)
        writer.declare(f't{i}', tails)
        writer.declare(f'x{i}', [heads[-1]])
        writer.declare(f'z{i}', sorted(set(writer.random.sample(sorted(joined), 8)) | writer.drawn(4, 8)))
        writer.declare(f'o{i}', sorted(writer.drawn(7, 8) | {f'zz{100000 + i}'}))
        writer.post('str_ne', f'x{i}', f'h{i}')
        writer.post('str_concat', f'h{i}', f't{i}', f'z{i}')
        writer.post('str_le', f'z{i}', f'o{i}')
        if i:
            writer.post('str_lt', f'o{i - 1}', f'o{i}')


def numbered(count):
    return [f't{i:06}' for i in range(count)]


def unequal(writer, size):
    writer.declare('x', [*numbered(size), 'u'])
    for text in numbered(size):
        writer.post('str_ne', 'x', f'"{text}"')


def circle(writer, size):
    for name, parity in (('x', 0), ('y', 1)):
        writer.declare(name, [*numbered(size)[parity::2], 'u'])
    writer.post('str_le', 'x', 'y')
    writer.post('str_le', 'y', 'x')


def staircase(writer, size):
    for i in range(size):
        writer.declare(f'x{i}', numbered(size)[max(i - 1, 0):i + 1])
    writer.post('str_all_different', f'[{", ".join(f"x{i}" for i in range(size))}]')


def ladder(writer, size):
    for i in range(size):
        writer.declare(f'x{i}', numbered(size))
        if i:
            writer.post('str_lt', f'x{i - 1}', f'x{i}')


def colours(writer, size):
    for i in range(size):
        writer.declare(f'x{i}', 'abcd')
        if i:
            writer.post('str_ne', f'x{i - 1}', f'x{i}')


# What grows, from size to size, and how many times as much there is to read and to write.
GROWTH = [('one variable unequal to n texts', unequal, 4000, 16000, 4), ('two orders in a circle', circle, 4000, 16000, 4),
          ('a staircase of n under all-different', staircase, 4000, 16000, 4),
          ('a chain of < over n texts, n variables', ladder, 250, 1000, 16),
          ('search along a chain of n', colours, 4000, 16000, 4)]


def run(command):
    """Processor time, peak memory in MB, and what stands for the output. The memory is at least that of this script."""
    with tempfile.TemporaryFile() as out:
        started = subprocess.Popen(command, stdout=out)
        _, status, usage = os.wait4(started.pid, 0)
        started.returncode = os.waitstatus_to_exitcode(status)
        if started.returncode != 0:
            sys.exit(f'{" ".join(command)}: {started.returncode}')
        out.seek(0)
        digest = hashlib.sha256()
        while piece := out.read(1 << 16):
            digest.update(piece)
        return usage.ru_utime + usage.ru_stime, usage.ru_maxrss / 1024, digest.digest()


def allocations(command):
    said = subprocess.run(['valgrind', '--leak-check=no', *command], capture_output=True, text=True, check=True).stderr
    return int(re.search(r'total heap usage: ([\d,]+)', said)[1].replace(',', ''))


def measured(commands):
    """The commands in turn, the least of all runs."""
    runs = [[run(command) for command in commands] for _ in range(RUNS)]
    best = [(min(r[i][0] for r in runs), min(r[i][1] for r in runs)) for i in range(len(commands))]
    if len({r[2] for r in runs[0]}) != 1:
        sys.exit(f'{commands}: not the same output')
    return best


def met(value, most):
    return '' if most is None else f'{most} {"yes" if value <= most else "**no**"}'


def beside_plain(write):
    print('| network | constraints | zornet | plain | ratio | wanted | memory | ratio | wanted | allocations | plain | wanted |')
    print('|---|---|---|---|---|---|---|---|---|---|---|---|')
    for make, size in itertools.product((order, order16, sets, mix, chain), (10000, 100000)):
        file = write(make, size)
        (time, memory), (plainTime, plainMemory) = measured([[ZORNET, '-q', file], [PLAIN, file]])
        most = WANTED.get((make.__name__, size), (None, None, None))
        per = [allocations(command) / size for command in ([ZORNET, '-q', file], [PLAIN, file])] if size <= 10000 else None
        most = (*most[:2], WANTED.get((make.__name__, 100000), (None, None, None))[2] if per else None)
        print(f'| {make.__name__} | {size:,} | {time:.3f} s | {plainTime:.3f} s | {time / plainTime:.2f} | '
              f'{met(time / plainTime, most[0])} | {memory:.0f} MB | {memory / plainMemory:.2f} | '
              f'{met(memory / plainMemory, most[1])} | '
              + (f'{per[0]:.1f} | {per[1]:.1f} | {met(per[0], most[2])} |' if per else '| | |'), flush=True)


def growth(write):
    print('\n| network | from | to | zornet | zornet | times as long | times as much |\n|---|---|---|---|---|---|---|')
    for name, make, small, large, factor in GROWTH:
        options = ['--solutions', '1'] if make is colours else []
        times = [measured([[ZORNET, '-q', *options, write(make, size)]])[0][0] for size in (small, large)]
        print(f'| {name} | {small:,} | {large:,} | {times[0]:.3f} s | {times[1]:.3f} s | {times[1] / times[0]:.1f} | {factor} |',
              flush=True)


def main():
    with tempfile.TemporaryDirectory() as folder:
        def write(make, size):
            file = pathlib.Path(folder) / f'{make.__name__}{size}.szn'
            if os.fork() == 0:  # the memory for it goes with the process
                writer = Writer()
                make(writer, size)
                file.write_text('\n'.join(writer.lines) + '\n')
                os._exit(0)
            if os.wait()[1] != 0:
                sys.exit(f'{file.name} was not written')
            return str(file)
        beside_plain(write)
        growth(write)


main()
