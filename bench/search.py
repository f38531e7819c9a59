#!/usr/bin/env python3
"""Search beside clingo and gecode: search.py ZORNET. Prints a table: seconds of processor time, the median of three runs.

The same problems for each: crosswords, one text more than there are texts for, all different, and all licence plates
under some rules. Each program's count of solutions is compared with the others'.
"""
import itertools
import pathlib
import random
import re
import resource
import statistics
import subprocess
import sys
import tempfile

RUNS, LETTERS = 3, 'abdeilmnorst'
draw = random.Random(7)


def szn_set(texts):
    return '{' + ', '.join(f'"{text}"' for text in texts) + '}'


def fzn_rows(rows):
    return f'[{",".join(str(cell) for row in rows for cell in row)}]'


class Crossword:
    """Words across and down; a letter belongs to one of each."""
    wanted = (None, None)

    def __init__(self, side, words, solutions):
        self.side, self.solutions = side, solutions
        self.name = f'crossword, {side} x {side} from {words} words, {"the first" if solutions else "all"}'
        if solutions is None:
            self.wanted = (None, 2.5)
        self.words = self.drawn(words)

    def drawn(self, count):
        weights = [1.5 if letter in 'aeio' else 1 for letter in LETTERS]
        words = set()
        while len(words) < count:
            words.add(''.join(draw.choices(LETTERS, weights, k=self.side)))
        return sorted(words)

    def szn(self):
        side = self.side
        lines = [f'set of string: words = {szn_set(self.words)};', f'set of string: letters = {szn_set(LETTERS)};',
                 f'array [0..{side * side - 1}] of var letters: cell;']
        for i in range(side):
            lines += [f'var words: across{i};', f'var words: down{i};']
        for i, j in itertools.product(range(side), repeat=2):
            lines += [f'constraint str_substr(across{i}, {j}, {j}, cell[{side * i + j}]);',
                      f'constraint str_substr(down{j}, {i}, {i}, cell[{side * i + j}]);']
        return '\n'.join(lines)

    def lp(self):
        side = self.side
        facts = [f'word({number},{place},{letter}).' for number, word in enumerate(self.words)
                 for place, letter in enumerate(word)]
        return '\n'.join(facts + [
            f'place(0..{side - 1}). number(0..{len(self.words) - 1}).',
            '1 {across(I,N) : number(N)} 1 :- place(I). 1 {down(I,N) : number(N)} 1 :- place(I).',
            'cell(I,J,L) :- across(I,N), word(N,J,L). cell(I,J,L) :- down(J,N), word(N,I,L).',
            ':- place(I), place(J), 2 {cell(I,J,L)}.'])

    def fzn(self):
        side = self.side
        rows = fzn_rows([[LETTERS.index(letter) for letter in word] for word in self.words])
        cells = [f'var 0..{len(LETTERS) - 1}: c{i} :: output_var;' for i in range(side * side)]
        lines = [f'array [1..{side * len(self.words)}] of int: rows = {rows};'] + cells
        for i in range(side):
            for places in ([side * i + j for j in range(side)], [side * j + i for j in range(side)]):
                lines.append(f'constraint gecode_table_int([{",".join(f"c{p}" for p in places)}],rows);')
        every = ','.join(f'c{i}' for i in range(side * side))
        return '\n'.join(lines + [f'solve :: int_search([{every}],dom_w_deg,indomain_min,complete) satisfy;'])


class Pigeons:
    """No solution: ten variables, nine texts."""
    name, solutions, wanted = 'all different, 10 from 9', 0, (None, None)
    holes = 9

    def szn(self):
        texts = szn_set([f't{i}' for i in range(self.holes)])
        return f'array [0..{self.holes}] of var {texts}: x;\nconstraint str_all_different(x);'

    def lp(self):
        return (f'1 {{in(P,H) : H = 1..{self.holes}}} 1 :- P = 0..{self.holes}. :- in(P,H), in(Q,H), P < Q.')

    def fzn(self):
        names = [f'x{i}' for i in range(self.holes + 1)]
        return '\n'.join([f'var 1..{self.holes}: {name} :: output_var;' for name in names] +
                         [f'constraint gecode_all_different_int([{",".join(names)}]);', 'solve satisfy;'])


class UnequalPigeons(Pigeons):
    """The same pair by pair, which has to be searched."""
    name, wanted = 'unequal in pairs, 9 from 8', (1, 6)
    holes = 8

    def szn(self):
        texts = szn_set([f't{i}' for i in range(self.holes)])
        pairs = itertools.combinations(range(self.holes + 1), 2)
        return '\n'.join([f'array [0..{self.holes}] of var {texts}: x;'] +
                         [f'constraint str_ne(x[{i}], x[{j}]);' for i, j in pairs])

    def fzn(self):
        pairs = itertools.combinations(range(self.holes + 1), 2)
        return '\n'.join([f'var 1..{self.holes}: x{i} :: output_var;' for i in range(self.holes + 1)] +
                         [f'constraint int_ne(x{i},x{j});' for i, j in pairs] + ['solve satisfy;'])


class Plates:
    """Two letters in order and three digits, no two of them alike and the last not less than the first."""
    name, solutions, wanted = 'plates under rules, all', None, (None, None)
    letters, digits = 'ABCDEF', '0123456789'

    def szn(self):
        lines = [f'var {szn_set(self.letters)}: a;', f'var {szn_set(self.letters)}: b;', 'var string: plate;']
        lines += [f'var {szn_set(self.digits)}: {name};' for name in 'pqr']
        lines += ['constraint str_lt(a, b);', 'constraint str_all_different([p, q, r]);', 'constraint str_le(p, r);',
                  'constraint str_concat([a, b, "-", p, q, r], plate);', 'output plate;']
        return '\n'.join(lines)

    def lp(self):
        return (f'1 {{a(0..{len(self.letters) - 1})}} 1. 1 {{b(0..{len(self.letters) - 1})}} 1. :- a(X), b(Y), X >= Y.'
                '1 {p(0..9)} 1. 1 {q(0..9)} 1. 1 {r(0..9)} 1. :- p(X), q(X). :- p(X), r(X). :- q(X), r(X).'
                ':- p(X), r(Y), X > Y.')

    def fzn(self):
        last = len(self.letters) - 1
        return '\n'.join([f'var 0..{last}: a :: output_var;', f'var 0..{last}: b :: output_var;'] +
                         [f'var 0..9: {name} :: output_var;' for name in 'pqr'] +
                         ['constraint int_lt(a,b);', 'constraint gecode_all_different_int([p,q,r]);',
                          'constraint int_le(p,r);', 'solve satisfy;'])


def run(command):
    """Processor time and output."""
    before = resource.getrusage(resource.RUSAGE_CHILDREN)
    done = subprocess.run(command, capture_output=True, text=True)
    after = resource.getrusage(resource.RUSAGE_CHILDREN)
    return after.ru_utime - before.ru_utime + after.ru_stime - before.ru_stime, done.stdout


def found_by(program, output):
    if program == 'clingo':
        return int(re.search(r'^Models +: (\d+)', output, re.M)[1])
    return len(re.findall(r'^-{10}$', output, re.M))


def met(value, most):
    return f'{value:.2f}' if most is None else f'{value:.2f} (at most {most}: {"met" if value <= most else "**not met**"})'


print('| Problem | solutions | zornet | clingo | gecode | of clingo | of gecode |\n|---|---|---|---|---|---|---|')
with tempfile.TemporaryDirectory() as folder:
    for problem in (Crossword(5, 1000, 1), Crossword(4, 60, None), Crossword(4, 100, None), Pigeons(), UnequalPigeons(),
                    Plates()):
        files = {}
        for kind in ('szn', 'lp', 'fzn'):
            files[kind] = pathlib.Path(folder) / f'problem.{kind}'
            files[kind].write_text(getattr(problem, kind)() + '\n')
        most = str(1 if problem.solutions == 1 else 0)
        commands = {'zornet': [sys.argv[1], '-q', '--solutions', '1' if most == '1' else '1000000', str(files['szn'])],
                    'clingo': ['clingo', most, str(files['lp'])],
                    'gecode': ['fzn-gecode', '-n', most, str(files['fzn'])]}
        times, counts = {}, {}
        for program, command in commands.items():
            runs = [run(command) for _ in range(RUNS)]
            times[program] = statistics.median(time for time, _ in runs)
            counts[program] = found_by(program, runs[0][1])
        if len(set(counts.values())) != 1:
            sys.exit(f'{problem.name}: {counts}')
        ratio = [times['zornet'] / max(times[peer], 0.001) for peer in ('clingo', 'gecode')]
        print(f"| {problem.name} | {counts['zornet']} | " + ' | '.join(f'{times[p]:.3f}' for p in commands) +
              f' | {met(ratio[0], problem.wanted[0])} | {met(ratio[1], problem.wanted[1])} |', flush=True)
