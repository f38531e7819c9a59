#!/usr/bin/env python3
"""What narrowing sees of texts that are not listed, beside z3 and cvc5: shapes.py ZORNET MODELS [SEED].

Random chains of concatenation with lengths, beginnings and ends, small enough for the solvers. A contradiction where a
solver finds a solution is a fault, and ends with exit code 1; the last lines count the contradictions that a solver
finds and zornet does not.
"""
import pathlib
import random
import subprocess
import sys
import tempfile

zornet, models, seed = sys.argv[1], int(sys.argv[2]), int((sys.argv + ['1'])[3])
draw = random.Random(seed)
SECONDS = 5


def word(longest, alphabet='ab'):
    return ''.join(draw.choice(alphabet) for _ in range(draw.randint(1, longest)))


class Chain:
    """One network in both languages."""

    def __init__(self):
        self.model, self.formula = [], ['(set-logic QF_SLIA)']
        parts = draw.randint(2, 5)
        self.texts = [f'x{i}' for i in range(parts)] + [f'z{i}' for i in range(1, parts)]
        for name in self.texts:
            self.add(f'var string: {name}; var 0..40: n_{name}; constraint str_length({name}, n_{name});',
                     f'(declare-const {name} String) (assert (<= (str.len {name}) 40))')
        before = 'x0'
        for i in range(1, parts):
            self.add(f'constraint str_concat({before}, x{i}, z{i});', f'(assert (= (str.++ {before} x{i}) z{i}))')
            before = f'z{i}'
        for _ in range(draw.randint(parts, 3 * parts)):
            self.constrain(draw.choice(self.texts))
        self.formula.append('(check-sat)')

    def add(self, line, assertion):
        self.model.append(line)
        self.formula.append(assertion)

    def constrain(self, x):
        kind, n = draw.randrange(6), draw.randint(0, 9)
        if kind == 0:
            self.add(f'constraint int_le(n_{x}, {n});', f'(assert (<= (str.len {x}) {n}))')
        elif kind == 1:
            self.add(f'constraint int_le({n}, n_{x});', f'(assert (<= {n} (str.len {x})))')
        elif kind == 2:
            self.add(f'constraint int_eq({n}, n_{x});', f'(assert (= {n} (str.len {x})))')
        elif kind == 3:
            text = word(4)
            self.add(f'constraint str_prefix("{text}", {x});', f'(assert (str.prefixof "{text}" {x}))')
        elif kind == 4:
            text = word(4)
            self.add(f'constraint str_suffix("{text}", {x});', f'(assert (str.suffixof "{text}" {x}))')
        else:
            y = draw.choice([y for y in self.texts if y != x])
            self.add(f'constraint str_eq({x}, {y});', f'(assert (= {x} {y}))')


def answer(command):
    try:
        return subprocess.run(command, capture_output=True, text=True, timeout=SECONDS + 1)
    except subprocess.TimeoutExpired:
        return None


def solved(command):
    done = answer(command)
    return done.stdout.split()[:1] if done else []


counts = {'contradictory': 0, 'seen': 0, 'missed': 0, 'satisfiable': 0, 'unknown': 0, 'wrong': 0}
with tempfile.TemporaryDirectory() as folder:
    model, formula = pathlib.Path(folder) / 'model.szn', pathlib.Path(folder) / 'formula.smt2'
    for _ in range(models):
        chain = Chain()
        model.write_text('\n'.join(chain.model) + '\n')
        formula.write_text('\n'.join(chain.formula) + '\n')
        narrowed = answer([zornet, '-q', str(model)])
        contradiction = narrowed is not None and narrowed.returncode == 1
        verdicts = [solved(['z3', f'-T:{SECONDS}', str(formula)]),
                    solved(['cvc5', '--strings-exp', f'--tlimit={1000 * SECONDS}', str(formula)])]
        if ['sat'] in verdicts:
            counts['satisfiable'] += 1
            if contradiction:
                counts['wrong'] += 1
                print('a contradiction in\n' + model.read_text())
        elif ['unsat'] in verdicts:
            counts['contradictory'] += 1
            counts['seen' if contradiction else 'missed'] += 1
            if not contradiction and '--show' in sys.argv:
                print('missed:\n' + model.read_text())
        else:
            counts['unknown'] += 1
print(', '.join(f'{name} {count}' for name, count in counts.items()))
print(f"missed {100 * counts['missed'] / max(counts['contradictory'], 1):.1f} % of the contradictions")
sys.exit(counts['wrong'] != 0)
